// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/xml/SaxParser.h"
#include "tests/unit/xml/XmlFixture.h"

class SaxParserTest : public XmlTest {
protected:
    SaxParserTest() {
        parser_->SetDocumentHandler(handler_.get());
        parser_->SetErrorHandler(handler_.get());
    }

    NCFRESULT Parse(const std::string& content) { return parser_->Parse(0, File(content).get()); }

    std::string LastMessage() {
        INCFString* message = nullptr;
        EXPECT_EQ(NCF_OK, parser_->GetLastMessage(&message));
        return Taken(message);
    }

    // A refused document: its code, that the message names file and reason,
    // that the error handler heard of it, and that no end was told.
    void ExpectRefused(const std::string& content, NCFRESULT code, const std::string& reason) {
        handler_->events.clear();
        handler_->messages.clear();
        EXPECT_EQ(code, Parse(content));
        const std::string message = LastMessage();
        EXPECT_EQ(0u, message.find((folder_ / "file.xml").u8string() + ":")) << message;
        EXPECT_NE(std::string::npos, message.find(reason)) << message;
        EXPECT_EQ(std::vector<std::string>{"fatal " + message}, handler_->messages);
        for (const std::string& event : handler_->events) {
            EXPECT_NE("end", event);
        }
    }

    host::Ref<host::SaxParser> parser_ = host::MakeRef<host::SaxParser>();
    host::Ref<RecordingHandler> handler_ = host::MakeRef<RecordingHandler>();
};

using Events = std::vector<std::string>;
