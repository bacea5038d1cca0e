// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "host_interfaces/parameters/ParametersXML.h"
#include "source/parameters/model/NMAParameterSuite.h"

namespace NMA::XMLUtils {

// Reads and writes single values of an object with parameters, by address:
// component, track, set, parameter. It keeps two documents, one to look at, and
// one for update, which is fetched when first needed and handed back as a whole
// by each write. Failures are thrown as the views throw them.
class NMAParametersVisitor {
public:
    explicit NMAParametersVisitor(INCFComponentFactory* factory);
    NMAParametersVisitor(INCFComponentFactory* factory, INCFParametersXML* handler);
    virtual ~NMAParametersVisitor();
    NMAParametersVisitor(const NMAParametersVisitor&) = delete;
    NMAParametersVisitor& operator=(const NMAParametersVisitor&) = delete;

    // Takes a reference to the object and loads the document to look at. Null
    // throws NCF_E_INVALIDARG. An update in progress goes on.
    NCFRESULT Attach(INCFParametersXML* handler);
    // The document to look at, the visitor's until the next Attach.
    NMAParameterSuite* GetSuite() const;

    // Loads the document for update, unless there is one.
    NCFRESULT BeginUpdate();
    // Hands that document back and drops it; one that is refused stays for a
    // further try. Without one NMA_E_NOTINITIALIZED is returned, not thrown.
    NCFRESULT EndUpdate();

    // In the document for update, which must be there.
    NCFRESULT FindParameter(const GUID& component, ncfUInt32 track, const GUID& set,
                            const GUID& parameter, NMAParameter& out);
    // 1 or throws: what is missing on the way throws NMA_E_NODATA.
    ncfBool HasParameterSet(const GUID& component, ncfUInt32 track, const GUID& set);

    // The document for update is fetched and stays for the next call.
    NCFRESULT GetUInt32(const GUID& component, ncfUInt32 track, const GUID& set,
                        const GUID& parameter, ncfUInt32& out) {
        return open(component, track, set, parameter).GetUInt32(out);
    }
    NCFRESULT GetSInt32(const GUID& component, ncfUInt32 track, const GUID& set,
                        const GUID& parameter, ncfSInt32& out) {
        return open(component, track, set, parameter).GetSInt32(out);
    }
    NCFRESULT GetUInt64(const GUID& component, ncfUInt32 track, const GUID& set,
                        const GUID& parameter, ncfUInt64& out) {
        return open(component, track, set, parameter).GetUInt64(out);
    }
    NCFRESULT GetSInt64(const GUID& component, ncfUInt32 track, const GUID& set,
                        const GUID& parameter, ncfSInt64& out) {
        return open(component, track, set, parameter).GetSInt64(out);
    }
    NCFRESULT GetDouble(const GUID& component, ncfUInt32 track, const GUID& set,
                        const GUID& parameter, double& out) {
        return open(component, track, set, parameter).GetDouble(out);
    }
    NCFRESULT GetRational(const GUID& component, ncfUInt32 track, const GUID& set,
                          const GUID& parameter, NMAParamRational& out) {
        return open(component, track, set, parameter).GetRational(out);
    }
    NCFRESULT GetString(const GUID& component, ncfUInt32 track, const GUID& set,
                        const GUID& parameter, NMAString& out) {
        return open(component, track, set, parameter).GetString(out);
    }
    NCFRESULT GetBoolean(const GUID& component, ncfUInt32 track, const GUID& set,
                         const GUID& parameter, bool& out) {
        return open(component, track, set, parameter).GetBoolean(out);
    }

    // Each hands the whole document back.
    NCFRESULT SetUInt32(const GUID& component, ncfUInt32 track, const GUID& set,
                        const GUID& parameter, ncfUInt32 value) {
        open(component, track, set, parameter).SetUInt32(value);
        return EndUpdate();
    }
    NCFRESULT SetSInt32(const GUID& component, ncfUInt32 track, const GUID& set,
                        const GUID& parameter, ncfSInt32 value) {
        open(component, track, set, parameter).SetSInt32(value);
        return EndUpdate();
    }
    NCFRESULT SetUInt64(const GUID& component, ncfUInt32 track, const GUID& set,
                        const GUID& parameter, ncfUInt64 value) {
        open(component, track, set, parameter).SetUInt64(value);
        return EndUpdate();
    }
    NCFRESULT SetSInt64(const GUID& component, ncfUInt32 track, const GUID& set,
                        const GUID& parameter, ncfSInt64 value) {
        open(component, track, set, parameter).SetSInt64(value);
        return EndUpdate();
    }
    NCFRESULT SetDouble(const GUID& component, ncfUInt32 track, const GUID& set,
                        const GUID& parameter, double value) {
        open(component, track, set, parameter).SetDouble(value);
        return EndUpdate();
    }
    NCFRESULT SetRational(const GUID& component, ncfUInt32 track, const GUID& set,
                          const GUID& parameter, const NMAParamRational& value) {
        open(component, track, set, parameter).SetRational(value);
        return EndUpdate();
    }
    NCFRESULT SetString(const GUID& component, ncfUInt32 track, const GUID& set,
                        const GUID& parameter, const NMAString& value) {
        open(component, track, set, parameter).SetString(value);
        return EndUpdate();
    }
    NCFRESULT SetBoolean(const GUID& component, ncfUInt32 track, const GUID& set,
                         const GUID& parameter, bool value) {
        open(component, track, set, parameter).SetBoolean(value);
        return EndUpdate();
    }

private:
    using GetText = NCFRESULT (INCFParametersXML::*)(INCFString*);

    void requireHandler() const;
    std::unique_ptr<NMAParameterSuite> load(GetText getText) const;
    NMAParameter open(const GUID& component, ncfUInt32 track, const GUID& set,
                      const GUID& parameter);

    NCFSmartPtr<INCFComponentFactory> factory_;
    NCFSmartPtr<INCFParametersXML> handler_;
    std::unique_ptr<NMAParameterSuite> readSuite_;
    std::unique_ptr<NMAParameterSuite> writeSuite_;
};

}  // namespace NMA::XMLUtils
