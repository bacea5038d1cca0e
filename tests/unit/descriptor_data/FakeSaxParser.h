// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <string>

#include "host_interfaces/xml/SaxParser.h"
#include "tests/support/fakes/FakeHost.h"

// A parser that reads no file: a script fires the events. Writes its calls
// into the journal.
class FakeSaxParser : public FakeObject<INCFSaxParser> {
public:
    struct Script {
        NCFRESULT setDocumentHandler = NCF_OK;
        NCFRESULT setErrorHandler = NCF_OK;
        std::function<NCFRESULT(UTIL::INCFSaxDocumentHandler* document,
                                UTIL::INCFSaxErrorHandler* errors)>
            parse;
        NCFRESULT lastMessageResult = NCF_OK;
        std::string lastMessage;
    };

    FakeSaxParser(const Script& script, Journal* journal) : script_(script), journal_(journal) {}
    ~FakeSaxParser() override {
        if (document_) {
            document_->Release();
        }
        if (errors_) {
            errors_->Release();
        }
    }

    NCFRESULT SetDocumentHandler(UTIL::INCFSaxDocumentHandler* handler) override {
        journal_->add("parser SetDocumentHandler");
        handler->AddRef();
        document_ = handler;
        return script_.setDocumentHandler;
    }
    NCFRESULT SetErrorHandler(UTIL::INCFSaxErrorHandler* handler) override {
        journal_->add("parser SetErrorHandler");
        handler->AddRef();
        errors_ = handler;
        return script_.setErrorHandler;
    }
    NCFRESULT Parse(ncfUInt32 zero, INCFString* path) override {
        journal_->add("parser Parse " + std::to_string(zero) + " " + TextOf(path));
        return script_.parse ? script_.parse(document_, errors_) : NCF_OK;
    }
    NCFRESULT GetLastMessage(INCFString** text) override {
        journal_->add("parser GetLastMessage");
        *text = nullptr;
        if (script_.lastMessageResult >= 0) {
            *text = MakeHostString(script_.lastMessage);
        }
        return script_.lastMessageResult;
    }

private:
    const Script& script_;
    Journal* journal_;
    UTIL::INCFSaxDocumentHandler* document_ = nullptr;
    UTIL::INCFSaxErrorHandler* errors_ = nullptr;
};
