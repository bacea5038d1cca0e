// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/aaf/doubles/UtilDouble.h"

#include <string>

#include "host_interfaces/util/NMAUtil.h"
#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"
#include "tests/support/fakes/FakeHost.h"

UtilDouble utilDouble;
NCFRESULT retrieverInit = NCF_OK;

namespace {

int stateOfDigest = 0;

void Tell(const std::string& line) {
    if (utilDouble.journal) {
        utilDouble.journal->add(line);
    }
}

}  // namespace

NCFRESULT NMASplitPath(INCFString* path, INCFString** name) {
    Tell("NMASplitPath " + TextOf(path));
    if (utilDouble.split >= 0) {
        *name = MakeHostString("a name");
    }
    return utilDouble.split;
}

NCFRESULT MakeURLPathFromFilePath(INCFString* path, INCFString** url) {
    Tell("MakeURLPathFromFilePath " + TextOf(path));
    if (utilDouble.url >= 0) {
        *url = MakeHostString("a url");
    }
    return utilDouble.url;
}

NCFRESULT GenerateUMIDFromData_Begin(void** state) {
    Tell("GenerateUMIDFromData_Begin");
    *state = &stateOfDigest;
    return utilDouble.begin;
}

NCFRESULT GenerateUMIDFromData_AddData(void** state, ncfUInt32 size, const unsigned char* data) {
    const bool known = *state == &stateOfDigest;
    Tell("GenerateUMIDFromData_AddData " +
         std::string(reinterpret_cast<const char*>(data), known ? size : 0));
    return utilDouble.add;
}

NCFRESULT GenerateUMIDFromData_Finish(void** state, GUID* uid) {
    Tell("GenerateUMIDFromData_Finish");
    if (utilDouble.finish >= 0 && *state == &stateOfDigest) {
        *uid = ncfGuid("11111111-2222-3333-4444-555555555555");
    }
    return utilDouble.finish;
}

NCFRESULT ConvertTCToFrames(ncfUInt32 hours, ncfUInt32 minutes, ncfUInt32 seconds, ncfUInt32 frames,
                            ncfUInt32 fps, bool dropFrame, ncfUInt32* out) {
    Tell("ConvertTCToFrames " + std::to_string(hours) + ":" + std::to_string(minutes) + ":" +
         std::to_string(seconds) + ":" + std::to_string(frames) + " at " + std::to_string(fps) +
         (dropFrame ? " drop" : ""));
    if (utilDouble.convert >= 0) {
        *out = utilDouble.frames;
    }
    return utilDouble.convert;
}

ncfUInt32 GetMaxDuration(ncfUInt32 fps, bool dropFrame) {
    Tell("GetMaxDuration " + std::to_string(fps) + (dropFrame ? " drop" : ""));
    return utilDouble.maxDuration;
}

NCFRESULT QuickTimeToAAFInfoRetriever::Init(NCFSmartPtr<INCFConsole>,
                                            NCFSmartPtr<INCFComponentFactory>,
                                            const char* fourCharXML, const char* AAFInfoXML) {
    Tell(std::string("Init ") + fourCharXML + " " + AAFInfoXML);
    return retrieverInit;
}

QuickTimeToAAFInfoRetriever* QuickTimeToAAFInfoRetriever::GetInstance() {
    return nullptr;
}

// Never reached without a retriever.
NCFRESULT QuickTimeToAAFInfoRetriever::GetInfoFromImageDescription(const DescribedPicture*,
                                                                   AAFInfo*, ncfUInt32*) {
    return NCF_E_UNEXPECTED;
}
bool QuickTimeToAAFInfoRetriever::IsMPEGDescriptor() const {
    return false;
}
bool QuickTimeToAAFInfoRetriever::IsRGBADescriptor() const {
    return false;
}

void ShutDownInfoRetriever() {}
