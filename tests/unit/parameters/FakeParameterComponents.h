// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdio>
#include <cstring>
#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "host_interfaces/parameters/ParameterIds.h"
#include "host_interfaces/parameters/ParameterSuite.h"
#include "host_interfaces/parameters/ParametersReader.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/parser/FakeCalls.h"

// Short words for ids in the journal.
inline std::string IdText(const GUID& id) {
    static const std::pair<GUID, const char*> kWords[] = {
        {kParamSetDefault, "set:default"},
        {kParamGroup, "group"},
        {kParamFieldOrdering, "ordering"},
        {kParamFieldLayout, "layout"},
        {kParamLevelRemapping, "levels"},
        {kParamTypeChoice, "choice"},
        {kValueTypeUInt32, "UInt32"},
        {ncfGuid("0E74B673-0CA8-403B-A142-986D79508637"), "mapping"},
    };
    for (const auto& [known, word] : kWords) {
        if (known == id) {
            return word;
        }
    }
    char text[12];
    std::snprintf(text, sizeof text, "%08X", static_cast<unsigned>(id.Data1));
    return text;
}

// A value that holds bytes; "value.<operation>" in the journal.
class FakeValue : public FakeObject<IParameterValue>, public FakeCalls {
public:
    explicit FakeValue(Journal* lines) : FakeCalls("value", lines) {}

    std::vector<ncfUInt8> bytes;
    void hold(ncfUInt32 number) {
        bytes.resize(sizeof number);
        std::memcpy(bytes.data(), &number, sizeof number);
    }
    ncfUInt32 number() const {
        ncfUInt32 held = 0;
        std::memcpy(&held, bytes.data(), std::min(bytes.size(), sizeof held));
        return held;
    }

    NCFRESULT Clear() override {
        bytes.clear();
        return enter("Clear");
    }
    NCFRESULT SetData(const GUID& type, const void* data, ncfUInt32 size, ncfUInt32 zero) override {
        const auto* const first = static_cast<const ncfUInt8*>(data);
        bytes.assign(first, first + size);
        journal->add("value.SetData " + IdText(type) + " " + std::to_string(number()) + " " +
                     std::to_string(size) + " " + std::to_string(zero));
        const auto found = results.find("SetData");
        return found == results.end() ? NCF_OK : found->second;
    }
    NCFRESULT GetData(void* data, ncfUInt32 size) override {
        if (size > bytes.size()) {
            return NCF_E_FAIL;
        }
        std::memcpy(data, bytes.data(), size);
        return NCF_OK;
    }
};

class FakeValueFactory : public FakeObject<IValueFactory>, public FakeCalls {
public:
    FakeValueFactory(Journal* lines, FakeValue* value)
        : FakeCalls("factory", lines), value_(value) {}
    NCFRESULT CreateValue(IParameterValue** out) override {
        return giveObject("CreateValue", out, value_);
    }

private:
    FakeValue* value_;  // the test's
};

// A suite that writes down what it is told, all arguments with it; its document
// is "<suite/>".
class FakeSuite : public FakeObject<IParameterSuite>, public FakeCalls {
public:
    explicit FakeSuite(Journal* lines) : FakeCalls("suite", lines) {}

    NCFRESULT SetComponentId(const GUID& id) override {
        return told("SetComponentId", " " + IdText(id));
    }
    NCFRESULT Prepare(ncfUInt32 track) override { return told("Prepare", Number(track)); }
    NCFRESULT WriteXML(INCFString* out) override {
        const NCFRESULT result = told("WriteXML", "");
        return result < 0 ? result : out->AssignUTF8(kNCFUTF8, "<suite/>", kNCFZeroTerminated);
    }
    NCFRESULT BeginDescription(float version) override {
        return told("BeginDescription", Float(version));
    }
    NCFRESULT AddGroup(const GUID& id, const char* name, ncfUInt32 a, ncfUInt32 b) override {
        return told("AddGroup", " " + IdText(id) + Quoted(name) + Number(a) + Number(b));
    }
    NCFRESULT AddParameter(const GUID& id, const char* internalName, const char* label, ncfUInt32 a,
                           const GUID& type) override {
        return told("AddParameter", " " + IdText(id) + Quoted(internalName) + Quoted(label) +
                                        Number(a) + " " + IdText(type));
    }
    NCFRESULT EndDescription() override { return told("EndDescription", ""); }
    NCFRESULT AddValueChoice(const char* text, ncfUInt32 value, ncfBool isDefault) override {
        return told("AddValueChoice", Quoted(text) + Number(value) + (isDefault ? " default" : ""));
    }
    NCFRESULT AddDependency(ncfUInt32 kind, const GUID& id, IParameterValue* value,
                            ncfUInt32 one) override {
        return told("AddDependency",
                    Number(kind) + " " + IdText(id) + Number(Held(value)) + Number(one));
    }
    NCFRESULT AddParamSet(const GUID& id, const char* name, ncfUInt32 a, float version,
                          ncfBool isDefault) override {
        return told("AddParamSet", " " + IdText(id) + Quoted(name) + Number(a) + Float(version) +
                                       Number(isDefault));
    }
    NCFRESULT AddParamValue(const GUID& id, IParameterValue* value) override {
        return told("AddParamValue", " " + IdText(id) + Number(Held(value)));
    }

private:
    static std::string Number(ncfSInt64 number) { return " " + std::to_string(number); }
    static std::string Float(float number) {
        char text[32];
        std::snprintf(text, sizeof text, " %.1f", static_cast<double>(number));
        return text;
    }
    static std::string Quoted(const char* text) {
        return text ? " '" + std::string(text) + "'" : " null";
    }
    static ncfUInt32 Held(IParameterValue* value) {
        ncfUInt32 number = 0xDEADBEEF;
        value->GetData(&number, sizeof number);
        return number;
    }
    NCFRESULT told(const std::string& operation, const std::string& arguments) {
        return enter((operation + arguments).c_str()) < 0 ? resultOf(operation + arguments)
                                                          : resultOf(operation);
    }
    NCFRESULT resultOf(const std::string& operation) {
        const auto found = results.find(operation);
        return found == results.end() ? NCF_OK : found->second;
    }
};

// A reader whose document is a script of the test's.
class FakeReader : public FakeObject<IParametersReader>, public FakeCalls {
public:
    explicit FakeReader(Journal* lines) : FakeCalls("reader", lines) {}
    ~FakeReader() override { drop(); }

    std::function<NCFRESULT(NMA::IParametersHandler&)> script;

    NCFRESULT SetHandler(NMA::IParametersHandler* handler) override {
        const NCFRESULT result = enter("SetHandler");
        drop();
        handler_ = handler;
        handler_->AddRef();
        return result;
    }
    NCFRESULT Parse(INCFString* xml) override {
        const NCFRESULT result = enter(("Parse " + TextOf(xml)).c_str());
        const auto found = results.find("Parse");
        if (found != results.end()) {
            return found->second;
        }
        return result < 0 || !script ? result : script(*handler_);
    }

private:
    void drop() {
        if (handler_) {
            handler_->Release();
        }
        handler_ = nullptr;
    }
    NMA::IParametersHandler* handler_ = nullptr;
};
