// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/aaf/support/FakeAAF.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "tests/unit/aaf/support/FakeAAFObject.h"

namespace {

FakeAAF* current = nullptr;

bool StartsWith(const std::string& line, const std::string& start) {
    return line.compare(0, start.size(), start) == 0;
}

}  // namespace

FakeAAF::FakeAAF() : before_(NMA::Impl::AAFRunTimeLibrary::Instance().SetAccess({Load, Find})) {
    current = this;
    dictionary_ = new FakeAAFObject(*this, "Dictionary");
}

FakeAAF::~FakeAAF() {
    dictionary_->release();
    EXPECT_EQ(live_, 0) << "AAF objects are left";
    NMA::Impl::AAFRunTimeLibrary::Instance().SetAccess(before_);
    current = nullptr;
}

void* FakeAAF::Load(const char*) {
    return current;
}

void* FakeAAF::Find(void*, const char* symbol) {
    static const std::vector<std::string> names = {
        "AAFFileOpenExistingRead", "AAFFileOpenExistingModify", "AAFFileOpenNewModify",
        "AAFFileIsAAFFile", "AAFGetPluginManager"};
    if (std::string(symbol) == "AAFFileOpenTransient") {
        return reinterpret_cast<void*>(&FakeAAF::OpenTransient);
    }
    return std::count(names.begin(), names.end(), symbol) ? current : nullptr;
}

HRESULT FakeAAF::OpenTransient(aafProductIdentification_t* ident, IAAFFile** file) {
    const aafProductVersion_t& version = *ident->productVersion;
    current->identification_ = Shown(ident->companyName) + "|" + Shown(ident->productName) + "|" +
                               Shown(ident->productVersionString) + "|" + Shown(ident->productID) +
                               "|" + Shown(ident->platform) + "|" + Shown(version.major) + "." +
                               Shown(version.minor) + "." + Shown(version.tertiary) + "." +
                               Shown(version.patchLevel) + " type " + Shown(version.type);
    const HRESULT result = current->note("AAFFileOpenTransient");
    if (result == 0) {
        *file = current->newFile();
    }
    return result;
}

IAAFFile* FakeAAF::newFile() {
    auto* const file = new FakeAAFObject(*this, nextName("File"));
    // A file has a dictionary of its own.
    auto* const dictionary = new FakeAAFObject(*this, "Dictionary");
    file->keep(dictionary);
    file->definitions.emplace_back(IID_IAAFDictionary, dictionary);
    dictionary->release();
    auto* const face = static_cast<IAAFFile*>(file->face(IID_IAAFFile));
    file->release();
    return face;
}

void* FakeAAF::makeFace(const std::string& className, const GUID& iid) {
    auto* const object = new FakeAAFObject(*this, nextName(className));
    void* const face = object->face(iid);
    object->release();
    return face;
}

void* FakeAAF::dictionaryFace(const GUID& iid) {
    return dictionary_->face(iid);
}

std::string FakeAAF::nextName(const std::string& className) {
    return className + std::to_string(++numbers_[className]);
}

std::vector<std::string> FakeAAF::linesOf(const std::string& object) const {
    return journal_.startingWith(object);
}

int FakeAAF::place(const std::string& start) const {
    const auto& lines = journal_.lines();
    const auto found = std::find_if(lines.begin(), lines.end(), [&](const std::string& line) {
        return StartsWith(line, start);
    });
    return found == lines.end() ? -1 : static_cast<int>(found - lines.begin());
}

void FakeAAF::refuseCall(int nth, HRESULT result) {
    refusals_.push_back({"", result, nth});
}

void FakeAAF::refuse(const std::string& start, HRESULT result, int nth) {
    refusals_.push_back({start, result, nth});
}

void FakeAAF::clearRefusals() {
    refusals_.clear();
    refused_ = 0;
}

HRESULT FakeAAF::note(const std::string& line) {
    ++calls_;
    journal_.add(line);
    for (Refusal& refusal : refusals_) {
        if (StartsWith(line, refusal.start) && --refusal.left == 0) {
            ++refused_;
            if (throwsRefusals) {
                throw static_cast<NCFRESULT>(refusal.result);
            }
            return refusal.result;
        }
    }
    return AAFRESULT_SUCCESS;
}
