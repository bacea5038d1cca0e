// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
// The functions that a program finds in this library by name.
#include <new>

#include "aaf_library/exports/FileEncoding.h"
#include "aaf_library/exports/LibraryPath.h"
#include "aaf_library/exports/ResultTable.h"
#include "aaf_library/model/Text.h"
#include "aaf_library/objects/File.h"
#include "aaf_library/objects/Fresh.h"
#include "aaf_library/objects/Header.h"
#include "aaf_library/objects/Listeners.h"
#include "aaf_library/objects/Paths.h"
#include "aaf_library/stored/StoredFile.h"
#include "host_interfaces/aaf/AAFExports.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "host_interfaces/framework/Compiler.h"

#define AAF_EXPORT extern "C" NCF_EXPORT

namespace {

// No exception of C++ may reach a caller who binds functions by name.
template <class Operation>
HRESULT Guarded(Operation operation) {
    try {
        return operation();
    } catch (const std::bad_alloc&) {
        return AAFRESULT_NOMEMORY;
    } catch (...) {
        return AAFRESULT_UNEXPECTED_EXCEPTION;
    }
}

// The kind that a file carries, if it is one that this library can read.
bool FindKind(aafCharacter_constptr fileName, aafUID_t& kind) {
    aaf::stored::SectorSize sectors{};
    if (!aaf::stored::IsAafFile(aaf::PathOf(fileName), &sectors)) {
        return false;
    }
    kind = sectors == aaf::stored::SectorSize::Bytes4096 ? kAAFFileKind_Aaf4KBinary
                                                         : kAAFFileKind_Aaf512Binary;
    return true;
}

constexpr aafUInt32 kAafFacility = 0x80120000u;

// Name and sentence of a result.
HRESULT TextOfResult(AAFRESULT result, std::wstring& text) {
    if (const aaf::ResultText* found = aaf::FindResultText(result)) {
        text = aaf::Widen(found->name);
        if (found->sentence[0] != 0) {
            text += L": " + aaf::Widen(found->sentence);
        }
        return AAFRESULT_SUCCESS;
    }
    const bool ours = (static_cast<aafUInt32>(result) & 0xFFFF0000u) == kAafFacility;
    return ours ? AAFRESULT_RESULT_NOT_RECOGNIZED : AAFRESULT_RESULT_NOT_AAF;
}

}  // namespace

AAF_EXPORT HRESULT AAFFileOpenTransient(aafProductIdentification_t* ident, IAAFFile** file) {
    return Guarded([=] { return aaf::File::OpenTransient(ident, file); });
}

AAF_EXPORT HRESULT AAFFileOpenExistingRead(aafCharacter_constptr fileName, aafUInt32 modeFlags,
                                           IAAFFile** file) {
    return Guarded([=] { return aaf::File::OpenToRead(fileName, modeFlags, file); });
}

AAF_EXPORT HRESULT AAFFileOpenExistingModify(aafCharacter_constptr fileName, aafUInt32 modeFlags,
                                             aafProductIdentification_t* ident, IAAFFile** file) {
    return Guarded([=] { return aaf::File::OpenToModify(fileName, modeFlags, ident, file); });
}

AAF_EXPORT HRESULT AAFFileOpenNewModify(aafCharacter_constptr fileName, aafUInt32 modeFlags,
                                        aafProductIdentification_t* ident, IAAFFile** file) {
    return Guarded([=] {
        return aaf::File::OpenNew(fileName, kAAFFileKind_DontCare, modeFlags, ident, file);
    });
}

AAF_EXPORT HRESULT AAFFileOpenNewModifyEx(aafCharacter_constptr fileName, aafUID_constptr fileKind,
                                          aafUInt32 modeFlags, aafProductIdentification_t* ident,
                                          IAAFFile** file) {
    if (fileKind == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return Guarded([=] { return aaf::File::OpenNew(fileName, *fileKind, modeFlags, ident, file); });
}

AAF_EXPORT HRESULT AAFFileIsAAFFile(aafCharacter_constptr fileName, aafUID_t* aAFFileKind,
                                    aafBool* fileIsAAFFile) {
    if (fileName == nullptr || aAFFileKind == nullptr || fileIsAAFFile == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return Guarded([=] {
        *fileIsAAFFile = FindKind(fileName, *aAFFileKind) ? kAAFTrue : kAAFFalse;
        return AAFRESULT_SUCCESS;
    });
}

AAF_EXPORT HRESULT AAFFileIsAAFFileKind(aafCharacter_constptr fileName, aafUID_constptr aAFFileKind,
                                        aafBool* fileIsAAFFile) {
    if (fileName == nullptr || aAFFileKind == nullptr || fileIsAAFFile == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return Guarded([=] {
        aafUID_t kind{};
        *fileIsAAFFile = FindKind(fileName, kind) && kind == *aAFFileKind ? kAAFTrue : kAAFFalse;
        return AAFRESULT_SUCCESS;
    });
}

// Plug-ins are for access to essence, which this library does not have; a
// loader wants to find the function all the same.
AAF_EXPORT HRESULT AAFGetPluginManager(IAAFPluginManager** pluginManager) {
    if (pluginManager == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *pluginManager = nullptr;
    return AAFRESULT_NOT_IMPLEMENTED;
}

AAF_EXPORT HRESULT AAFSetProgressCallback(IAAFProgress* progress) {
    return Guarded([=] {
        aaf::SetProgressListener(progress);
        return AAFRESULT_SUCCESS;
    });
}

AAF_EXPORT HRESULT AAFSetDiagnosticOutput(IAAFDiagnosticOutput* output) {
    return Guarded([=] {
        aaf::SetDiagnosticListener(output);
        return AAFRESULT_SUCCESS;
    });
}

AAF_EXPORT HRESULT AAFGetFileEncodings(IEnumAAFFileEncodings** fileEncodings) {
    return Guarded([=] { return aaf::EnumerateFileEncodings(fileEncodings); });
}

AAF_EXPORT HRESULT AAFGetLibraryVersion(aafProductVersion_t* version) {
    if (version == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *version = aaf::LibraryVersion();
    return AAFRESULT_SUCCESS;
}

AAF_EXPORT HRESULT AAFGetLibraryPathNameBufLen(aafUInt32* bufSize) {
    if (bufSize == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return Guarded([=] { return aaf::TextSize(aaf::LibraryPath(), bufSize); });
}

AAF_EXPORT HRESULT AAFGetLibraryPathName(aafCharacter* libraryPathName, aafUInt32 bufSize) {
    if (libraryPathName == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return Guarded([=] { return aaf::CopyText(aaf::LibraryPath(), libraryPathName, bufSize); });
}

AAF_EXPORT HRESULT AAFResultToTextBufLen(AAFRESULT result, aafUInt32* resultTextSize) {
    if (resultTextSize == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return Guarded([=] {
        std::wstring text;
        const HRESULT found = TextOfResult(result, text);
        return found < 0 ? found : aaf::TextSize(text, resultTextSize);
    });
}

AAF_EXPORT HRESULT AAFResultToText(AAFRESULT result, aafCharacter* resultText,
                                   aafUInt32 resultTextSize) {
    if (resultText == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return Guarded([=] {
        std::wstring text;
        const HRESULT found = TextOfResult(result, text);
        return found < 0 ? found : aaf::CopyText(text, resultText, resultTextSize);
    });
}

// Beyond the published functions, so a program asks for it by name and does
// without where there is none: fixes the time and the generation id that new
// objects and saved files get, so that equal content gives equal files. Null
// lets either run free again.
AAF_EXPORT HRESULT AAFCliphostPinTime(const aafTimeStamp_t* time, const aafUID_t* generation) {
    return Guarded([=] {
        aaf::PinTime(time, generation);
        return AAFRESULT_SUCCESS;
    });
}
