// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Functions that the run-time library exports, with C linkage, by name: the way to
// the first object. Module and host find them in the loaded library by these types;
// the module opens a transient file for each description, the host opens files to
// read and to save. Functions on different files may run on several threads; the
// listeners that are set here hold for the whole process. What comes out belongs to
// the caller.

struct IAAFFile;
struct IAAFRawStorage;
struct IAAFPluginManager;
struct IAAFProgress;
struct IAAFDiagnosticOutput;
struct IAAFCachePageAllocator;
struct IEnumAAFFileEncodings;

using AAFFileOpenExistingReadFunction = HRESULT (*)(aafCharacter_constptr fileName,
                                                    aafUInt32 modeFlags, IAAFFile** file);
using AAFFileOpenExistingModifyFunction = HRESULT (*)(aafCharacter_constptr fileName,
                                                      aafUInt32 modeFlags,
                                                      aafProductIdentification_t* ident,
                                                      IAAFFile** file);
using AAFFileOpenNewModifyFunction = HRESULT (*)(aafCharacter_constptr fileName,
                                                 aafUInt32 modeFlags,
                                                 aafProductIdentification_t* ident,
                                                 IAAFFile** file);
using AAFFileOpenNewModifyExFunction = HRESULT (*)(aafCharacter_constptr fileName,
                                                   aafUID_constptr fileKind, aafUInt32 modeFlags,
                                                   aafProductIdentification_t* ident,
                                                   IAAFFile** file);
using AAFFileOpenTransientFunction = HRESULT (*)(aafProductIdentification_t* ident,
                                                 IAAFFile** file);
using AAFFileIsAAFFileFunction = HRESULT (*)(aafCharacter_constptr fileName, aafUID_t* aAFFileKind,
                                             aafBool* fileIsAAFFile);
using AAFRawStorageIsAAFFileFunction = HRESULT (*)(IAAFRawStorage* rawStorage,
                                                   aafUID_t* aAFFileKind,
                                                   aafBool* rawStorageIsAAFFile);
using AAFFileIsAAFFileKindFunction = HRESULT (*)(aafCharacter_constptr fileName,
                                                 aafUID_constptr aAFFileKind,
                                                 aafBool* fileIsAAFFile);
using AAFRawStorageIsAAFFileKindFunction = HRESULT (*)(IAAFRawStorage* rawStorage,
                                                       aafUID_constptr aAFFileKind,
                                                       aafBool* rawStorageIsAAFFile);
using AAFGetPluginManagerFunction = HRESULT (*)(IAAFPluginManager** pluginManager);
using AAFCreateRawStorageMemoryFunction = HRESULT (*)(aafFileAccess_t access,
                                                      IAAFRawStorage** newRawStorage);
using AAFCreateRawStorageDiskFunction = HRESULT (*)(aafCharacter_constptr filename,
                                                    aafFileExistence_t existence,
                                                    aafFileAccess_t access,
                                                    IAAFRawStorage** newRawStorage);
using AAFCreateRawStorageCachedDiskFunction = HRESULT (*)(aafCharacter_constptr filename,
                                                          aafFileExistence_t existence,
                                                          aafFileAccess_t access,
                                                          aafUInt32 pageCount, aafUInt32 pageSize,
                                                          IAAFRawStorage** newRawStorage);
using AAFCreateRawStorageCachedFunction = HRESULT (*)(IAAFRawStorage* rawStorage,
                                                      aafUInt32 pageCount, aafUInt32 pageSize,
                                                      IAAFRawStorage** newRawStorage);
using AAFCreateRawStorageCached2Function = HRESULT (*)(IAAFRawStorage* rawStorage,
                                                       aafUInt32 pageCount, aafUInt32 pageSize,
                                                       IAAFCachePageAllocator* cachePageAllocator,
                                                       IAAFRawStorage** newRawStorage);
using AAFCreateAAFFileOnRawStorageFunction =
    HRESULT (*)(IAAFRawStorage* rawStorage, aafFileExistence_t existence, aafFileAccess_t access,
                aafUID_constptr fileKind, aafUInt32 modeFlags,
                aafProductIdentification_constptr ident, IAAFFile** newFile);
using AAFSetProgressCallbackFunction = HRESULT (*)(IAAFProgress* progress);
using AAFGetFileEncodingsFunction = HRESULT (*)(IEnumAAFFileEncodings** fileEncodings);
using AAFSetDiagnosticOutputFunction = HRESULT (*)(IAAFDiagnosticOutput* output);
using AAFGetLibraryVersionFunction = HRESULT (*)(aafProductVersion_t* version);
using AAFGetLibraryPathNameBufLenFunction = HRESULT (*)(aafUInt32* bufSize);
using AAFGetLibraryPathNameFunction = HRESULT (*)(aafCharacter* libraryPathName, aafUInt32 bufSize);
using AAFResultToTextBufLenFunction = HRESULT (*)(AAFRESULT result, aafUInt32* resultTextSize);
using AAFResultToTextFunction = HRESULT (*)(AAFRESULT result, aafCharacter* resultText,
                                            aafUInt32 resultTextSize);

// Mode flags of the open functions.
inline constexpr aafUInt32 AAF_FILE_MODE_LAZY_LOADING = 1;
inline constexpr aafUInt32 AAF_FILE_MODE_REVERTABLE = 2;
inline constexpr aafUInt32 AAF_FILE_MODE_UNBUFFERED = 4;
inline constexpr aafUInt32 AAF_FILE_MODE_RECLAIMABLE = 8;
inline constexpr aafUInt32 AAF_FILE_MODE_USE_LARGE_SS_SECTORS = 0x10000000;
inline constexpr aafUInt32 AAF_FILE_MODE_CLOSE_FAIL_DIRTY = 0x20000000;

// Kinds of file.
inline constexpr aafUID_t kAAFFileKind_Aaf512Binary =
    ncfGuid("42464141-000D-4D4F-060E-2B34010101FF");
inline constexpr aafUID_t kAAFFileKind_Aaf4KBinary =
    ncfGuid("92B02EFB-AF40-4896-A58E-D1572F422B58");
inline constexpr aafUID_t kAAFFileKind_AafXmlText = ncfGuid("FE0D0101-60E1-4E78-B2CD-2B03DBB0FA87");
inline constexpr aafUID_t kAAFFileKind_AafKlvBinary =
    ncfGuid("4B464141-000D-4D4F-060E-2B34010101FF");
inline constexpr aafUID_t kAAFFileKind_DontCare = ncfGuid("00000000-0000-0000-0000-000000000000");

// Name of the library's file, as the published loader asks for it.
#ifdef _WIN32
inline constexpr char kAAFLibraryName[] = "AAFCOAPI.dll";
#else
inline constexpr char kAAFLibraryName[] = "libcom-api.so";
#endif
