// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Arbitrary text as the documents of an object with parameters: everything in
// it is read and written through the views, and what can be saved must load.

#include <cstdlib>
#include <string>

#include "fuzz/parameter_model/ViewWalk.h"
#include "fuzz/support/RunLimits.h"
#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/framework/Host.h"
#include "reference_host/framework/String.h"
#include "reference_host/xml/RegisterXmlComponents.h"
#include "source/parameters/model/NMAParametersVisitor.h"

namespace {

using NMA::XMLUtils::NMAParameterSuite;
using NMA::XMLUtils::NMAParametersVisitor;

// Gives one text as every document and takes whatever it is given.
class Parameters final : public host::Component<INCFParametersXML> {
public:
    explicit Parameters(INCFString* text) : text_(text) {}

    NCFRESULT GetParameterValuesXML(INCFString* xml) override { return xml->Assign(text_); }
    NCFRESULT GetParameterDescriptionXML(INCFString* xml) override { return xml->Assign(text_); }
    NCFRESULT GetDefaultValuesXML(INCFString* xml) override { return xml->Assign(text_); }
    NCFRESULT SetParameterValuesXML(INCFString* xml) override { return text_->Assign(xml); }
    NCFRESULT ParametersUnsupportedOperation(void*) override { return NCF_E_NOTIMPL; }
    NCFRESULT ResetParameters() override { return NCF_OK; }

private:
    INCFString* text_;  // outlives the object
};

// What the walk left of the document, handed over and fetched again.
void SaveAndReload(NMAParameterSuite& suite, NMAParametersVisitor& visitor,
                   Parameters& parameters) {
    NMAString saved;
    try {
        suite.SaveToString(saved);
    } catch (NCFRESULT) {
        return;  // the changes made it too deep
    }
    parameters.SetParameterValuesXML(saved.InArg());
    try {
        visitor.BeginUpdate();
        visitor.EndUpdate();
        visitor.Attach(&parameters);
    } catch (NCFRESULT) {
        std::abort();  // what was saved must load
    }
    fuzz::WalkSuite(*visitor.GetSuite());
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static host::Host* const host = [] {
        auto* made = new host::Host;
        host::RegisterXmlComponents(*made);
        NMAInitialize(&made->factory());
        return made;
    }();
    const fuzz::TimeLimit limit;
    const std::string_view bytes(reinterpret_cast<const char*>(data), size);
    const auto text = host::MakeString(bytes);
    const auto parameters = host::MakeRef<Parameters>(text.get());
    try {
        NMAParametersVisitor visitor(&host->factory(), parameters.get());
        fuzz::WalkSuite(*visitor.GetSuite());
        SaveAndReload(*visitor.GetSuite(), visitor, *parameters);
    } catch (NCFRESULT) {
        // no document at all
    }
    return 0;
}
