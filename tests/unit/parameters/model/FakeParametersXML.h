// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <string>

#include "host_interfaces/parameters/ParametersXML.h"
#include "tests/support/fakes/FakeHost.h"

// An object with parameters that holds two documents, keeps what it is given,
// refuses what it is told to, and writes its calls into a journal.
class FakeParametersXML final : public FakeObject<INCFParametersXML> {
public:
    explicit FakeParametersXML(Journal& journal) : journal_(journal) {}

    std::string values;
    std::string description;
    std::map<std::string, NCFRESULT> refusals;  // by operation

    NCFRESULT GetParameterValuesXML(INCFString* xml) override {
        return Give("GetParameterValuesXML", values, xml);
    }
    NCFRESULT GetParameterDescriptionXML(INCFString* xml) override {
        return Give("GetParameterDescriptionXML", description, xml);
    }
    NCFRESULT GetDefaultValuesXML(INCFString*) override { return Hear("GetDefaultValuesXML"); }
    NCFRESULT SetParameterValuesXML(INCFString* xml) override {
        const NCFRESULT result = Hear("SetParameterValuesXML");
        if (result >= 0) {
            values = TextOf(xml);
        }
        return result;
    }
    NCFRESULT ParametersUnsupportedOperation(void*) override { return NCF_E_NOTIMPL; }
    NCFRESULT ResetParameters() override { return Hear("ResetParameters"); }

private:
    NCFRESULT Hear(const std::string& operation) {
        journal_.add(operation);
        const auto refused = refusals.find(operation);
        return refused == refusals.end() ? NCF_OK : refused->second;
    }
    NCFRESULT Give(const std::string& operation, const std::string& text, INCFString* xml) {
        const NCFRESULT result = Hear(operation);
        return result < 0 ? result : xml->AssignUTF8(kNCFUTF16, text.c_str(), kNCFZeroTerminated);
    }

    Journal& journal_;
};
