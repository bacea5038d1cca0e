// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Any bytes as a document of values for a clip: through the host's reader into
// the built module. What is taken comes back out of the next document; what is
// refused changes nothing.

#include <cstdlib>

#include "fuzz/support/ModuleSession.h"
#include "fuzz/support/RunLimits.h"
#include "host_interfaces/media/SampleMapping.h"
#include "host_interfaces/parameters/ParametersXML.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/framework/ObjectCount.h"
#include "reference_host/parameters/ParameterDocument.h"
#include "reference_host/util/text/HostText.h"

namespace {

void Require(bool holds) {
    if (!holds) {
        std::abort();
    }
}

std::string ValuesOf(INCFParametersXML& parameters) {
    const auto text = host::MakeString("");
    const NCFRESULT result = parameters.GetParameterValuesXML(text.get());
    // A set without identifier has no document.
    Require(result == NCF_OK || result == NMA_E_NOTINITIALIZED);
    return host::text::ReadUtf8(text.get());
}

NCFRESULT Set(INCFParametersXML& parameters, const std::string& xml) {
    return parameters.SetParameterValuesXML(host::MakeString(xml).get());
}

// One mapping of one movie for the process.
class Clip {
public:
    Clip() {
        host::Ref<NMA::IMediaContainer3> container;
        Require(cliphost::OpenContainer(fuzz::TheSession(), CLIPHOST_FUZZ_MOVIE, container) ==
                NCF_OK);
        Require(container->GetSampleMapping(mapping_.Out()) == NCF_OK);
        // The first change makes what the clip then keeps.
        const auto parameters = Ask();
        defaults_ = ValuesOf(*parameters);
        Require(Set(*parameters, defaults_) == NCF_OK);
    }
    host::Ref<INCFParametersXML> Ask() {
        host::Ref<INCFParametersXML> parameters;
        Require(host::Query(mapping_.get(), parameters) == NCF_OK);
        return parameters;
    }
    const std::string& defaults() const { return defaults_; }
    void ForgetNotices() { fuzz::TheSession().TakeNotices(); }

private:
    host::Ref<NMA::ISampleMapping> mapping_;
    std::string defaults_;
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static Clip& clip = *new Clip;
    const fuzz::TimeLimit limit;
    const std::int64_t before = host::LiveObjectCount();
    const std::string bytes(reinterpret_cast<const char*>(data), size);
    {
        const auto parameters = clip.Ask();
        host::ParameterDocument document;
        std::string problem;
        const NCFRESULT read = host::ReadParameterDocument(bytes, document, problem);
        const NCFRESULT set = Set(*parameters, bytes);
        const std::string values = ValuesOf(*parameters);
        if (read < 0) {
            Require(set < 0 && !problem.empty() && values == clip.defaults());
        } else {
            // Only a value of a kind that isn't carried fails after that.
            Require(set == NCF_OK || set == NCF_E_FAIL);
        }
        Require(values.empty() || Set(*parameters, values) == NCF_OK);
        Require(ValuesOf(*parameters) == values);
        Require(Set(*parameters, clip.defaults()) == NCF_OK);
        Require(ValuesOf(*parameters) == clip.defaults());
    }
    clip.ForgetNotices();
    Require(host::LiveObjectCount() == before);
    return 0;
}
