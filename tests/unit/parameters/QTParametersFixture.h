// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/media/PluginComponents.h"
#include "source/parameters/QTParameters.h"
#include "tests/unit/essence/support/MappingFixture.h"
#include "tests/unit/parameters/FakeParameterComponents.h"

// Parameters of a mapping over a fake clip, in a host whose suite, reader and
// values write down what they are asked. One picture track, so that a refresh
// has something to do.
class QTParametersFixture : public MappingFixture {
protected:
    using QTParameters = NMA::Impl::QTParameters;

    QTParametersFixture() {
        suite = new FakeSuite(&journal);
        reader = new FakeReader(&journal);
        value = new FakeValue(&journal);
        factory = new FakeValueFactory(&journal, value);
        const auto serve = [this](const GUID& component, auto* object, const char* name) {
            host->maker(component, [object](const GUID& iid, void** out) {
                return object->QueryInterface(iid, out);
            });
            host->name(component, name);
        };
        serve(CompID_ParameterSuite, suite, "suite");
        serve(CompID_ParametersReader, reader, "reader");
        serve(kValueTypeUInt32, factory, "factory");
        host->name(NCFCompID_NCFString, "string");
        host->name(NMA::CompID_QTParameters, "parameters");
        host->maker(NMA::CompID_QTParameters, [this](const GUID& iid, void** out) {
            return CreateInstanceOf<NMA::Impl::QTParameters>(host->unknown(), nullptr, iid, out);
        });
        xml.attach(MakeHostString("unchanged"));
    }
    ~QTParametersFixture() override {
        parameters = nullptr;
        for (INCFUnknown* const object :
             {static_cast<INCFUnknown*>(suite), static_cast<INCFUnknown*>(reader),
              static_cast<INCFUnknown*>(value), static_cast<INCFUnknown*>(factory)}) {
            EXPECT_EQ(object->Release(), 0u) << "a reference to a host object is left";
        }
    }

    // The parameters of the clip as it is now.
    void Attach() {
        AddVideo(1);
        Bind();
        void* out = nullptr;
        ASSERT_EQ(mapping->QueryInterface(IID_INCFParametersXML, &out), NCF_OK);
        Take(out);
        journal.clear();
    }
    // Parameters that belong to nothing.
    void MakeUnattached() {
        void* out = nullptr;
        ASSERT_EQ(CreateInstanceOf<NMA::Impl::QTParameters>(host->unknown(), nullptr,
                                                            IID_INCFParametersXML, &out),
                  NCF_OK);
        Take(out);
        journal.clear();
    }
    ClipParams& Record() { return *clip->GetClipParams(); }
    QTParameters& object() { return dynamic_cast<QTParameters&>(*parameters.inArg()); }

    // Lets the reader tell of one component with one set and its values.
    struct Told {
        GUID component = NMA::CompID_QuickTimeSampleMapping;
        GUID set = kCustom;
        const char* name = "My set";  // or null
        ncfUInt32 state = 1;
        std::vector<std::pair<GUID, ncfUInt32>> values;
    };
    NCFRESULT Set(Told told) {
        reader->script = [this, told](NMA::IParametersHandler& handler) {
            NCFSmartPtr<INCFString> name;
            if (told.name) {
                name.attach(MakeHostString(told.name));
            }
            EXPECT_EQ(handler.BeginDocument(), NCF_OK);
            EXPECT_EQ(handler.BeginComponent(told.component), NCF_OK);
            EXPECT_EQ(handler.BeginParamSet(told.set, name.inArg(), 1.0f, told.state), NCF_OK);
            for (const auto& [parameter, number] : told.values) {
                value->hold(number);
                EXPECT_EQ(handler.ParamValue(parameter, value), NCF_OK);
            }
            EXPECT_EQ(handler.EndComponent(1), NCF_OK);
            return handler.EndDocument();
        };
        return parameters->SetParameterValuesXML(xml.inArg());
    }
    // Name and flag of the set that a values document would hold now.
    std::string CurrentSet() {
        journal.clear();
        EXPECT_EQ(parameters->GetParameterValuesXML(xml.inArg()), NCF_OK);
        const Lines sets = journal.startingWith("suite.AddParamSet ");
        return sets.size() == 1 ? sets[0].substr(sizeof("suite.AddParamSet ") - 1) : "?";
    }
    // The calls of a values document with three numbers.
    static Lines WrittenSet(const std::string& set, ncfUInt32 ordering, ncfUInt32 layout,
                            ncfUInt32 levels) {
        Lines lines = {"suite.AddParamSet " + set, "create factory", "factory.CreateValue"};
        for (const auto& [parameter, number] :
             {std::pair<const char*, ncfUInt32>{"ordering", ordering},
              {"layout", layout},
              {"levels", levels}}) {
            lines.push_back("value.Clear");
            lines.push_back("value.SetData UInt32 " + std::to_string(number) + " 4 0");
            lines.push_back(std::string("suite.AddParamValue ") + parameter + " " +
                            std::to_string(number));
        }
        return lines;
    }

    static constexpr GUID kCustom = ncfGuid("11111111-2222-3333-4444-555555555555");

    FakeSuite* suite;
    FakeReader* reader;
    FakeValue* value;
    FakeValueFactory* factory;
    NCFSmartPtr<INCFString> xml;
    NCFSmartPtr<INCFParametersXML> parameters;

private:
    void Take(void* out) { parameters.attach(static_cast<INCFParametersXML*>(out)); }
};

inline Lines operator+(Lines left, const Lines& right) {
    left.insert(left.end(), right.begin(), right.end());
    return left;
}
