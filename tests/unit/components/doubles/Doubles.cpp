// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/components/doubles/Doubles.h"

#include "host_interfaces/util/NMAVolume.h"
#include "source/aaf/NewAAFFromMovie.h"
#include "tests/support/fakes/FakeHost.h"

VolumeDouble volumeDouble;
DescriptionDouble descriptionDouble;

struct NMAVolume::State {};

NMAVolume::NMAVolume(INCFString* path) : state_(nullptr) {
    volumeDouble.paths.push_back(TextOf(path));
}
NMAVolume::~NMAVolume() {
    delete state_;
}

INCFString* NMAVolume::GetFirstFile(const char* pattern, void*& handle) {
    volumeDouble.patterns.push_back(pattern);
    if (volumeDouble.throws) {
        throw NCF_E_HANDLE;
    }
    handle = volumeDouble.names.data();
    return GetNextFile(handle);
}

INCFString* NMAVolume::GetNextFile(void*& handle) {
    auto* const name = static_cast<std::string*>(handle);
    if (name == volumeDouble.names.data() + volumeDouble.names.size()) {
        return nullptr;
    }
    handle = name + 1;
    INCFString* const made = MakeHostString(*name);
    if (volumeDouble.change) {
        volumeDouble.change(*made);
    }
    volumeDouble.handedOut.push_back(made);
    return made;
}

ncfUInt64 NMAVolume::GetModificationDate(INCFString* name) {
    return volumeDouble.dates[TextOf(name)];
}

ncfUInt32 NMAVolume::GetVolumeSerialNumber() {
    return 0x12345678;
}
INCFString* NMAVolume::GetVolumeLabel() {
    return MakeHostString("a label");
}
ncfUInt32 NMAVolume::GetVolumeType() {
    return 4;
}

NCFRESULT NMA::Impl::NewAAFFromMovie(std::tr1::shared_ptr<BaseClip> media,
                                     NCFSmartPtr<INCFConsole> pConsole, IAAFFile** pOutAAFFile,
                                     INCFComponentFactory* pComponentFactory) {
    descriptionDouble.clips.push_back(media);
    descriptionDouble.console = pConsole.inArg();
    descriptionDouble.factory = pComponentFactory;
    return descriptionDouble.describe(pOutAAFFile);
}
