// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/SaxParser.h"

#include "reference_host/framework/Guard.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/util/text/HostText.h"
#include "reference_host/xml/EventReader.h"
#include "reference_host/xml/InputFile.h"

namespace host {

namespace {

// A host string that is lent for one call after the other. A receiver that keeps it has it: the
// next call gets a new one.
class LentString {
public:
    INCFString* With(std::string_view utf8) {
        if (string_ && IsOursAlone()) {
            string_->HoldUtf8(utf8);
        } else {
            string_ = MakeString(utf8, kNCFUTF8);
        }
        return string_.get();
    }

private:
    bool IsOursAlone() const {
        string_->AddRef();
        return string_->Release() == 1;
    }

    Ref<String> string_;
};

// Hands events on as host strings, which live for the call.
class HandlerEvents final : public XmlEvents {
public:
    explicit HandlerEvents(UTIL::INCFSaxDocumentHandler* handler) : handler_(handler) {}

    NCFRESULT OnElement(const char* name, const char** attributes) override {
        if (handler_ == nullptr) {
            return NCF_OK;
        }
        NCFRESULT result = handler_->Element(name_.With(name));
        for (; result >= 0 && *attributes != nullptr; attributes += 2) {
            result = handler_->Attribute(name_.With(attributes[0]), text_.With(attributes[1]));
        }
        return result;
    }

    NCFRESULT OnText(std::string_view text) override {
        return handler_ == nullptr ? NCF_OK : handler_->Text(text_.With(text));
    }

private:
    UTIL::INCFSaxDocumentHandler* handler_;
    LentString name_;
    LentString text_;
};

}  // namespace

NCFRESULT SaxParser::SetDocumentHandler(UTIL::INCFSaxDocumentHandler* handler) {
    documentHandler_ = Ref<UTIL::INCFSaxDocumentHandler>(handler);
    return NCF_OK;
}

NCFRESULT SaxParser::SetErrorHandler(UTIL::INCFSaxErrorHandler* handler) {
    errorHandler_ = Ref<UTIL::INCFSaxErrorHandler>(handler);
    return NCF_OK;
}

NCFRESULT SaxParser::Parse(ncfUInt32 zero, INCFString* path) {
    return Guarded([&]() -> NCFRESULT {
        lastMessage_.clear();
        Need(zero == 0, NCF_E_INVALIDARG);
        return path == nullptr ? NCF_E_POINTER : ParseFile(path);
    });
}

NCFRESULT SaxParser::GetLastMessage(INCFString** text) {
    return GiveString(lastMessage_, text);
}

NCFRESULT SaxParser::ParseFile(INCFString* path) {
    std::filesystem::path file;
    const NCFRESULT named = PathFrom(path, file);
    if (named < 0) {
        return Fail(named, text::ReadUtf8(path) + ": this can't be the name of a file", true);
    }
    const std::string name = DisplayPath(file);
    // The handlers may be changed while they run.
    const Ref<UTIL::INCFSaxDocumentHandler> handler = documentHandler_;
    HandlerEvents events(handler.get());
    EventReader reader(events, nullptr);
    bool started = false;
    NCFRESULT stopped = NCF_OK;
    std::string problem;
    const NCFRESULT result = ReadInputFile(
        file,
        [&](const char* bytes, std::size_t size, bool last) {
            if (!started && handler) {
                stopped = handler->Start();
            }
            started = true;
            return stopped < 0 ? stopped : reader.Feed(bytes, size, last);
        },
        problem);
    if (!problem.empty()) {
        return Fail(result, name + ": " + problem, true);
    }
    if (stopped < 0) {
        return Fail(stopped, name + ": the reader of the document did not start", false);
    }
    if (result < 0) {
        return Fail(result, name + ":" + reader.problem(), !reader.refusedByReceiver());
    }
    return handler ? handler->End() : NCF_OK;
}

NCFRESULT SaxParser::Fail(NCFRESULT code, const std::string& message, bool tellHandler) {
    lastMessage_ = message;
    const Ref<UTIL::INCFSaxErrorHandler> handler = errorHandler_;
    if (tellHandler && handler) {
        // The handler releases the message.
        handler->FatalError(MakeString(message).Detach());
    }
    return code;
}

}  // namespace host
