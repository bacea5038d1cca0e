// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/EventReader.h"

#include <expat.h>

#include <cstdio>
#include <new>

#include "reference_host/framework/Guard.h"
#include "reference_host/xml/XmlLimits.h"

namespace host {

namespace {

// Sizes cross to the parser as int.
constexpr std::size_t kMostAtOnce = std::size_t{1} << 20;

}  // namespace

struct EventReader::State {
    explicit State(XmlEvents& receiver) : events(receiver) {}
    ~State() {
        if (parser != nullptr) {
            XML_ParserFree(parser);
        }
    }
    State(const State&) = delete;
    State& operator=(const State&) = delete;

    XmlEvents& events;
    XML_Parser parser = nullptr;
    std::string run;  // text since the last mark
    int depth = 0;
    NCFRESULT result = NCF_OK;
    std::string problem;
    XmlPlace problemPlace;
    std::string problemText;
    bool byReceiver = false;

    XmlPlace Here() const {
        return {XML_GetCurrentLineNumber(parser), XML_GetCurrentColumnNumber(parser) + 1};
    }

    // The first failure counts. The parser may deliver a few events more after
    // it was stopped.
    void Fail(NCFRESULT code, const std::string& what) {
        if (result < 0) {
            return;
        }
        result = code;
        problemPlace = Here();
        problemText = what;
        problem = std::to_string(problemPlace.line) + ":" + std::to_string(problemPlace.column) +
                  ": " + what;
        XML_StopParser(parser, XML_FALSE);
    }

    void FailFromReceiver(NCFRESULT code) {
        char text[64];
        std::snprintf(text, sizeof(text), "the reader of the document stopped with 0x%08X",
                      static_cast<unsigned>(code));
        byReceiver = result >= 0;
        Fail(code, text);
    }

    void Flush() {
        if (run.empty() || result < 0) {
            return;
        }
        const NCFRESULT taken = events.OnText(run);
        run.clear();
        if (taken < 0) {
            FailFromReceiver(taken);
        }
    }

    void Element(const char* name, const char** attributes) {
        Flush();
        if (result < 0) {
            return;
        }
        if (++depth > XmlLimits::kDeepest) {
            Fail(NCF_E_NOTSUPPORTED,
                 "more than " + std::to_string(XmlLimits::kDeepest) + " levels of elements");
            return;
        }
        const NCFRESULT taken = events.OnElement(name, attributes);
        if (taken < 0) {
            FailFromReceiver(taken);
        }
    }

    void ElementEnd() {
        const NCFRESULT taken = result < 0 ? NCF_OK : events.OnElementEnd();
        if (taken < 0) {
            FailFromReceiver(taken);
        }
    }

    void Text(const char* text, int length) {
        if (result < 0) {
            return;
        }
        if (run.size() + static_cast<std::size_t>(length) > XmlLimits::kLongestText) {
            Fail(NCF_E_NOTSUPPORTED, "a text that is too long");
            return;
        }
        run.append(text, static_cast<std::size_t>(length));
    }

    // The parser is C: nothing may be thrown through its frames.
    template <class Body>
    static void Run(void* user, Body body) noexcept {
        auto* state = static_cast<State*>(user);
        const NCFRESULT thrown = Guarded([&] {
            body(*state);
            return NCF_OK;
        });
        if (thrown >= 0 || state->result < 0) {
            return;
        }
        Guarded([&] {
            state->FailFromReceiver(thrown);
            return NCF_OK;
        });
        state->result = thrown;  // even when there was no memory for the words
        XML_StopParser(state->parser, XML_FALSE);
    }

    static void XMLCALL OnStart(void* user, const char* name, const char** attributes) {
        Run(user, [&](State& state) { state.Element(name, attributes); });
    }
    static void XMLCALL OnEnd(void* user, const char*) {
        Run(user, [](State& state) {
            state.Flush();
            --state.depth;
            state.ElementEnd();
        });
    }
    static void XMLCALL OnCharacters(void* user, const char* text, int length) {
        Run(user, [&](State& state) { state.Text(text, length); });
    }
    static void XMLCALL OnComment(void* user, const char*) {
        Run(user, [](State& state) { state.Flush(); });
    }
    static void XMLCALL OnInstruction(void* user, const char*, const char*) {
        Run(user, [](State& state) { state.Flush(); });
    }
    static void XMLCALL OnDoctype(void* user, const char*, const char*, const char*, int) {
        Run(user, [](State& state) {
            state.Fail(NCF_E_NOTSUPPORTED,
                       "a document type declaration, which documents here may not have");
        });
    }
};

EventReader::EventReader(XmlEvents& events, const char* encoding)
    : state_(std::make_unique<State>(events)) {
    state_->parser = XML_ParserCreate(encoding);
    if (state_->parser == nullptr) {
        throw std::bad_alloc();
    }
    XML_SetUserData(state_->parser, state_.get());
    XML_SetElementHandler(state_->parser, State::OnStart, State::OnEnd);
    XML_SetCharacterDataHandler(state_->parser, State::OnCharacters);
    XML_SetCommentHandler(state_->parser, State::OnComment);
    XML_SetProcessingInstructionHandler(state_->parser, State::OnInstruction);
    XML_SetStartDoctypeDeclHandler(state_->parser, State::OnDoctype);
}

EventReader::~EventReader() = default;

NCFRESULT EventReader::Feed(const char* bytes, std::size_t size, bool last) {
    State& state = *state_;
    do {
        const std::size_t piece = size < kMostAtOnce ? size : kMostAtOnce;
        const bool final = last && piece == size;
        if (state.result < 0) {
            return state.result;
        }
        const XML_Status status =
            XML_Parse(state.parser, bytes, static_cast<int>(piece), final ? 1 : 0);
        if (status != XML_STATUS_OK) {
            const XML_Error error = XML_GetErrorCode(state.parser);
            const bool memory = error == XML_ERROR_NO_MEMORY;
            state.Fail(memory ? NCF_E_OUTOFMEMORY : NCF_E_FAIL, XML_ErrorString(error));
            return state.result;
        }
        bytes += piece;
        size -= piece;
    } while (size > 0);
    return state.result;
}

XmlPlace EventReader::place() const {
    return state_->Here();
}

std::uint64_t EventReader::byteOffset() const {
    const XML_Index offset = XML_GetCurrentByteIndex(state_->parser);
    return offset < 0 ? 0 : static_cast<std::uint64_t>(offset);
}

XmlPlace EventReader::problemPlace() const {
    return state_->problemPlace;
}

const std::string& EventReader::problemText() const {
    return state_->problemText;
}

const std::string& EventReader::problem() const {
    return state_->problem;
}

bool EventReader::refusedByReceiver() const {
    return state_->byReceiver;
}

}  // namespace host
