// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/parameters/ParametersReader.h"

#include "reference_host/framework/Guard.h"
#include "reference_host/framework/String.h"
#include "reference_host/parameters/ParameterValue.h"
#include "reference_host/util/text/HostText.h"
#include "text/Encodings.h"

namespace host {

namespace {

enum SetState : ncfUInt32 { kNotInUse = 0, kInUse = 1, kInUseReadOnly = 2 };

void TellSet(NMA::IParametersHandler& handler, const ParameterTrack& track,
             const ParameterSet& set) {
    const SetState state = !track.IsInUse(set) ? kNotInUse
                           : set.isReadOnly    ? kInUseReadOnly
                                               : kInUse;
    const Ref<String> name = MakeString(set.name, kNCFUTF8);
    Check(handler.BeginParamSet(set.id, name.get(), set.version, state));
    for (const ParameterSetting& setting : set.settings) {
        const Ref<ParameterValue> value = MakeRef<ParameterValue>(setting.value);
        Check(handler.ParamValue(setting.parameter, value.get()));
    }
}

// The handler hears nothing of tracks: sets of all of them come in turn. Its first
// failure ends the events.
void Tell(NMA::IParametersHandler& handler, const ParameterDocument& document) {
    Check(handler.BeginDocument());
    for (const ParameterComponent& component : document.components) {
        Check(handler.BeginComponent(component.id));
        for (const ParameterTrack& track : component.tracks) {
            for (const ParameterSet& set : track.sets) {
                TellSet(handler, track, set);
            }
        }
        Check(handler.EndComponent(1));
    }
    Check(handler.EndDocument());
}

}  // namespace

NCFRESULT ParametersReader::SetHandler(NMA::IParametersHandler* handler) {
    handler_ = Ref<NMA::IParametersHandler>(handler);
    return NCF_OK;
}

NCFRESULT ParametersReader::Parse(INCFString* xml) {
    return Guarded([&] {
        Need(xml);
        Need(handler_, NMA_E_NOTINITIALIZED);
        ParameterDocument document;
        std::string problem = "a character that has no place in it";
        std::string bytes;
        NCFRESULT result = NCF_E_FAIL;
        if (xml->GetLength() > ParameterLimits::kLargestDocument) {
            result = NCF_E_NOTSUPPORTED;
            problem = "it is too large";
        } else if (encodings::ToUtf8(text::Read(xml), bytes)) {
            result = ReadParameterDocument(bytes, document, problem);
        }
        if (result < 0) {
            if (console_) {
                console_->Write(1, "Parameter document refused: %s", problem.c_str());
            }
            return result;
        }
        // The handler may let go of this reader's reference to it.
        const Ref<NMA::IParametersHandler> handler = handler_;
        Tell(*handler, document);
        return NCF_OK;
    });
}

}  // namespace host
