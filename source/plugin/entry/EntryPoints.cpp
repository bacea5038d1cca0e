// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The six functions that the module exports. They take no lock; the host does
// not start or stop a module while it uses it.

#include "host_interfaces/framework/PluginEntry.h"
#include "host_interfaces/util/NMAStringUtils.h"
#include "host_interfaces/util/NMAUtil.h"
#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"
#include "source/plugin/CNCFClassFactory.h"
#include "source/plugin/NCFSmartPtr.h"
#include "source/plugin/PluginFolder.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/PluginLogger.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"
#include "source/plugin/entry/ComponentTable.h"
#include "source/plugin/os/Os.h"

namespace {

constexpr GUID kPluginId = ncfGuid("3E245FDC-8520-4428-BB4B-F3F939BF51E2");
constexpr GUID kPluginSecondId = ncfGuid("DE75C3CF-E649-4F97-A0B4-859BEAEB15A0");
constexpr GUID kComponentType = ncfGuid("D5906204-709B-11D6-91B2-0030658A6504");

constexpr char kPluginName[] = "QuickTime Plug-In";
constexpr char kVendorName[] = "Cliphost";
constexpr char kDescription[] = "QuickTime * Media Volume & Media Stream Plug-in (MVP & MSP)";

constexpr GUID kDescriptionAttribute = ncfGuid("3C099C4A-7FD2-11D6-9AEF-00306542A024");

// An attribute of 32 bits: what the host reads from it is the host's affair.
struct NumberAttribute {
    GUID id;
    GUID valueType;
    ncfUInt32 value;
};
constexpr NumberAttribute kAttributeA = {ncfGuid("7709BE44-1BCF-11E3-B718-001F2903051E"),
                                         kNCFValueTypeUInt32, 2};
constexpr NumberAttribute kAttributeB = {ncfGuid("7709BE45-1BCF-11E3-B718-001F2903051E"),
                                         kNCFValueTypeUInt32, 6720};
constexpr NumberAttribute kComponentAttributes[] = {
    {ncfGuid("2111CE92-6699-4398-BCDD-86820FD47FAC"), kNCFValueTypeFourBytes, 1},
    {ncfGuid("52AB377D-36AF-4FED-B5E0-2DE6B3432477"), kNCFValueTypeFourBytes, 0},
    {ncfGuid("19D46FB3-CA72-43FC-9A38-445A7FAFD3FF"), kNCFValueTypeFourBytes, 1},
};

template <class Pointer>
void SetNumber(const Pointer& definition, const NumberAttribute& attribute) {
    ThrowIfFailed(definition->SetAttribute(attribute.id, attribute.valueType, &attribute.value,
                                           sizeof attribute.value));
}

// A body that throws or succeeds.
template <class Body>
NCFRESULT Guarded(Body body) {
    return NMA::Impl::ResultOf([&] {
        body();
        return NCF_OK;
    });
}

NMAString ModulePath() {
    std::wstring path;
    if (!os::GetModulePath(reinterpret_cast<const void*>(&ModulePath), &path)) {
        ThrowIfFailed(NCF_E_FAIL);
    }
    return NMAStringUtils::CreateWCharNMAString(path.c_str(), -1);
}

// The folder of a path as a host string of its own, so that a refused string is
// seen here and not by whoever reads it later.
NCFSmartPtr<INCFString> FolderOf(const NMAString& path) {
    NCFSmartPtr<INCFString> folder;
    ThrowIfFailed(NMAString::CreateString(folder.outArg()));
    ThrowIfFailed(folder->AssignUTF16(
        kNCFWCHAR, NMAStringUtils::GetParentFolder(path).GetUTF16String(), kNCFZeroTerminated));
    return folder;
}

}  // namespace

NCF_PLUGIN_EXPORT NCFRESULT NCFRegisterPlugin(INCFUnknown* host,
                                              INCFPluginDefinition** outDefinition) {
    if (!host || !outDefinition) {
        return NCF_E_POINTER;
    }
    *outDefinition = nullptr;
    return Guarded([&] {
        NCFSmartPtr<INCFUnknown> proof;
        ThrowIfFailed(ncfQuery(host, IID_INCFHostUnknown, proof));
        NCFSmartPtr<INCFComponentFactory> factory;
        ThrowIfFailed(ncfQuery(host, factory));
        NCFSmartPtr<INCFPluginDefinition> definition;
        ThrowIfFailed(ncfCreate(factory.inArg(), CompID_PluginDefinition, IID_INCFPluginDefinition,
                                definition));
        ThrowIfFailed(definition->Define(kPluginId, 1, 3, kPluginName, kPluginSecondId, kVendorName,
                                         kComponentCount, 1));
        ThrowIfFailed(definition->SetAttribute(kDescriptionAttribute, kNCFValueTypeText,
                                               kDescription, 0xFFFFFFFFu));
        SetNumber(definition, kAttributeA);
        SetNumber(definition, kAttributeB);
        *outDefinition = definition.detach();
    });
}

NCF_PLUGIN_EXPORT NCFRESULT NCFRegisterComponent(INCFUnknown* host, ncfUInt32 index,
                                                 INCFComponentDefinition** outDefinition) {
    if (!host || !outDefinition) {
        return NCF_E_POINTER;
    }
    if (index >= kComponentCount) {
        return NCF_E_INVALIDARG;
    }
    *outDefinition = nullptr;
    const NCFRESULT result = Guarded([&] {
        NCFSmartPtr<INCFComponentFactory> factory;
        ThrowIfFailed(ncfQuery(host, factory));
        NCFSmartPtr<INCFComponentDefinition> definition;
        ThrowIfFailed(ncfCreate(factory.inArg(), CompID_ComponentDefinition,
                                IID_INCFComponentDefinition, definition));
        for (const NumberAttribute& attribute : kComponentAttributes) {
            SetNumber(definition, attribute);
        }
        const ComponentRow& row = kComponents[index];
        ThrowIfFailed(definition->Define(row.componentId, kComponentType, row.major, row.minor,
                                         row.classId, row.displayName));
        *outDefinition = definition.detach();
        SetNumber(*outDefinition, kAttributeA);
        SetNumber(*outDefinition, kAttributeB);
    });
    if (result < 0 && *outDefinition) {
        (*outDefinition)->Release();
        *outDefinition = nullptr;
    }
    return result;
}

NCF_PLUGIN_EXPORT NCFRESULT NCFGetClassFactory(INCFUnknown* host, const GUID& classId,
                                               const GUID& interfaceId, void** outFactory) {
    if (!host || !outFactory) {
        return NCF_E_INVALIDARG;
    }
    *outFactory = nullptr;
    const CreationFunction creator = FindCreator(classId);
    if (!creator) {
        return NCF_CLASS_E_CLASSNOTAVAILABLE;
    }
    return CNCFClassFactory::Create(creator, interfaceId, outFactory);
}

// A refusal is told by a failure code.
NCF_PLUGIN_EXPORT NCFRESULT NCFCanUnloadNow(INCFUnknown* host) {
    if (!host) {
        return NCF_E_INVALIDARG;
    }
    return GetObjectCount() == 0 ? NCF_OK : NCF_E_FAIL;
}

NCF_PLUGIN_EXPORT NCFRESULT NCFStartup(INCFUnknown* host) {
    return Guarded([&] {
        NCFSmartPtr<INCFComponentFactory> factory;
        ThrowIfFailed(ncfQuery(host, factory));
        ThrowIfFailed(NMAInitialize(factory.inArg()));
        const NMAString modulePath = ModulePath();
        PluginLogger().SetName(kPluginName);
        PluginLogSink::Instance().Start(factory.inArg());
        LogVersionInfo(&PluginLogger(), kPluginName, modulePath);
        SetPluginFolder(FolderOf(modulePath).inArg());
    });
}

NCF_PLUGIN_EXPORT NCFRESULT NCFShutdown(INCFUnknown*) {
    SetPluginFolder(nullptr);
    ShutDownInfoRetriever();
    NMAString text(kPluginName);
    text += NMAString(" Unloaded");
    PluginLogger().Write(4, "%s", text.GetUTF8String());
    PluginLogSink::Instance().Stop();
    NMATerminate();
    return NCF_OK;
}
