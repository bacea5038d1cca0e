// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

#include "host_interfaces/framework/ResultCodes.h"

namespace host {

// Where a document has something: line and column from 1, the column in characters.
struct XmlPlace {
    std::uint64_t line = 1;
    std::uint64_t column = 1;
};

// Receives what an EventReader meets; what is not overridden is passed over. Texts are UTF-8 and
// valid for the call only. A negative result ends the reading; a thrown one does the same.
class XmlEvents {
public:
    virtual ~XmlEvents() = default;
    // `attributes` are names and values by turns, closed by a null.
    virtual NCFRESULT OnElement(const char* /*name*/, const char** /*attributes*/) {
        return NCF_OK;
    }
    // A whole run of text between two marks, white space included. Entities,
    // CDATA sections and the ends of buffers don't split it; comments do.
    virtual NCFRESULT OnText(std::string_view /*text*/) { return NCF_OK; }
    virtual NCFRESULT OnElementEnd() { return NCF_OK; }
};

// Checks a document that comes in pieces, and tells of it. Anything that is
// not well-formed, any document type declaration (and so every entity of the
// document's own) and anything beyond the limits ends it.
class EventReader {
public:
    // `encoding` overrides what the document says of itself; null: it decides.
    EventReader(XmlEvents& events, const char* encoding);
    ~EventReader();
    EventReader(const EventReader&) = delete;
    EventReader& operator=(const EventReader&) = delete;

    // The first failure is the result of this and every later call.
    NCFRESULT Feed(const char* bytes, std::size_t size, bool last);

    // During an event: where what it tells of begins; of a text, where it ends. The second is the
    // same as a count of bytes from the start of what was fed.
    XmlPlace place() const;
    std::uint64_t byteOffset() const;

    // "line:column: what is wrong", empty without a failure.
    const std::string& problem() const;
    // The same apart.
    XmlPlace problemPlace() const;
    const std::string& problemText() const;
    // Whether the failure came from the events' receiver and not the document.
    bool refusedByReceiver() const;

private:
    struct State;
    std::unique_ptr<State> state_;
};

}  // namespace host
