// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <cwchar>
#include <string>
#include <utility>
#include <vector>

#include "host_interfaces/aaf/AAF.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitionIds.h"
#include "host_interfaces/aaf/AAFExports.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "host_interfaces/aaf/AAFTypeIds.h"
#include "tests/unit/aaf_library/Get.h"

// The library's functions, linked by name.
extern "C" {
HRESULT AAFFileOpenTransient(aafProductIdentification_t* ident, IAAFFile** file);
HRESULT AAFFileOpenExistingRead(aafCharacter_constptr fileName, aafUInt32 modeFlags,
                                IAAFFile** file);
HRESULT AAFFileOpenExistingModify(aafCharacter_constptr fileName, aafUInt32 modeFlags,
                                  aafProductIdentification_t* ident, IAAFFile** file);
HRESULT AAFFileOpenNewModify(aafCharacter_constptr fileName, aafUInt32 modeFlags,
                             aafProductIdentification_t* ident, IAAFFile** file);
HRESULT AAFFileOpenNewModifyEx(aafCharacter_constptr fileName, aafUID_constptr fileKind,
                               aafUInt32 modeFlags, aafProductIdentification_t* ident,
                               IAAFFile** file);
HRESULT AAFFileIsAAFFile(aafCharacter_constptr fileName, aafUID_t* aAFFileKind,
                         aafBool* fileIsAAFFile);
HRESULT AAFFileIsAAFFileKind(aafCharacter_constptr fileName, aafUID_constptr aAFFileKind,
                             aafBool* fileIsAAFFile);
HRESULT AAFGetPluginManager(IAAFPluginManager** pluginManager);
HRESULT AAFSetProgressCallback(IAAFProgress* progress);
HRESULT AAFSetDiagnosticOutput(IAAFDiagnosticOutput* output);
HRESULT AAFGetFileEncodings(IEnumAAFFileEncodings** fileEncodings);
HRESULT AAFGetLibraryVersion(aafProductVersion_t* version);
HRESULT AAFGetLibraryPathNameBufLen(aafUInt32* bufSize);
HRESULT AAFGetLibraryPathName(aafCharacter* libraryPathName, aafUInt32 bufSize);
HRESULT AAFResultToTextBufLen(AAFRESULT result, aafUInt32* resultTextSize);
HRESULT AAFResultToText(AAFRESULT result, aafCharacter* resultText, aafUInt32 resultTextSize);
HRESULT AAFCliphostPinTime(const aafTimeStamp_t* time, const aafUID_t* generation);
}

namespace aaf_test {

// Owns one reference.
template <class T>
class Ptr {
public:
    Ptr() = default;
    explicit Ptr(T* adopted) : pointer_(adopted) {}
    Ptr(const Ptr& other) : pointer_(other.pointer_) {
        if (pointer_ != nullptr) {
            pointer_->AddRef();
        }
    }
    Ptr(Ptr&& other) noexcept : pointer_(std::exchange(other.pointer_, nullptr)) {}
    ~Ptr() { Reset(); }
    Ptr& operator=(Ptr other) noexcept {
        std::swap(pointer_, other.pointer_);
        return *this;
    }
    void Reset() {
        if (pointer_ != nullptr) {
            std::exchange(pointer_, nullptr)->Release();
        }
    }
    // Drops what is held, for use as an out argument.
    T** Out() {
        Reset();
        return &pointer_;
    }
    IUnknown** OutUnknown() { return reinterpret_cast<IUnknown**>(Out()); }
    T* get() const { return pointer_; }
    T* operator->() const { return pointer_; }
    operator T*() const { return pointer_; }

private:
    T* pointer_ = nullptr;
};

template <class T>
ULONG ReferencesOf(T* pointer) {
    pointer->AddRef();
    return pointer->Release();
}

template <class To, class From>
Ptr<To> As(From* from) {
    Ptr<To> to;
    EXPECT_EQ(AAFRESULT_SUCCESS, from->QueryInterface(aafIdOf(static_cast<const To*>(nullptr)),
                                                      reinterpret_cast<void**>(to.Out())));
    return to;
}
template <class To, class From>
Ptr<To> As(const Ptr<From>& from) {
    return As<To>(from.get());
}

// What an operation gives whose last argument is an interface output, after at
// most one other argument. A failure throws, and so fails the test.
template <class Object, class Interface, class T>
Ptr<T> Get(const Object& object, HRESULT (Interface::*operation)(T**)) {
    Ptr<T> got;
    if (const HRESULT result = ((*object).*operation)(got.Out()); result != AAFRESULT_SUCCESS) {
        throw result;
    }
    return got;
}
template <class Object, class Interface, class Given, class T, class Argument>
Ptr<T> Get(const Object& object, HRESULT (Interface::*operation)(Given, T**),
           const Argument& argument) {
    Ptr<T> got;
    if (const HRESULT result = ((*object).*operation)(argument, got.Out());
        result != AAFRESULT_SUCCESS) {
        throw result;
    }
    return got;
}

// A product identification whose texts live as long as it does.
struct Product {
    Product();
    std::wstring company = L"Cliphost";
    std::wstring name = L"Tests";
    std::wstring versionText = L"1.0";
    std::wstring platform = L"Test machine";
    aafProductVersion_t version{1, 2, 3, 4, kAAFVersionDebug};
    aafProductIdentification_t ident{};
};

// An open transient file with its header and dictionary. At its end nothing
// but the fixture may hold the file.
class TransientFile : public ::testing::Test {
protected:
    TransientFile();
    ~TransientFile() override;

    template <class T>
    Ptr<T> Make(const aafUID_t& classId) {
        Ptr<T> made;
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  dictionary_->CreateInstance(classId, aafIdOf(static_cast<const T*>(nullptr)),
                                              made.OutUnknown()));
        return made;
    }
    Ptr<IAAFDataDef> DataDef(const aafUID_t& id);
    Ptr<IAAFSourceClip> Clip(aafLength_t length,
                             const aafUID_t& dataDef = kAAFDataDef_LegacyPicture);
    Ptr<IAAFComponent> Filler(aafLength_t length,
                              const aafUID_t& dataDef = kAAFDataDef_LegacyPicture);
    // A file mob that can be saved.
    Ptr<IAAFMob> FileMob(aafUInt8 number);

    Product product_;
    Ptr<IAAFFile> file_;
    Ptr<IAAFHeader> header_;
    Ptr<IAAFDictionary> dictionary_;
};

aafMobID_t MobId(aafUInt8 number);
bool SameMobId(const aafMobID_t& left, const aafMobID_t& right);

// Reads a text by its two operations: Text(mob, &IAAFMob::GetName, ...).
template <class T>
std::wstring TextOf(T* object, HRESULT (T::*getLength)(aafUInt32*),
                    HRESULT (T::*get)(aafCharacter*, aafUInt32)) {
    aafUInt32 bytes = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, (object->*getLength)(&bytes));
    std::vector<aafCharacter> buffer(bytes / sizeof(aafCharacter) + 1);
    EXPECT_EQ(AAFRESULT_SUCCESS, (object->*get)(buffer.data(), bytes));
    return buffer.data();
}

// Name and text of each tagged value.
using Texts = std::vector<std::pair<std::wstring, std::wstring>>;
Texts Comments(IAAFMob* mob);

}  // namespace aaf_test
