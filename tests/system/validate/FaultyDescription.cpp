// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/system/validate/FaultyDescription.h"

#include <atomic>
#include <cstring>
#include <fstream>
#include <memory>
#include <vector>

#include "host_interfaces/aaf/AAFEnumerations.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "not_implemented/AAFFile.h"
#include "not_implemented/AAFMobs.h"
#include "tests/system/validate/FaultyObject.h"

namespace faulty {
namespace {

struct Mob {
    aafMobID_t id{};
    aafMobKind_t kind = kAAFMasterMob;
};

struct Content {
    std::vector<Mob> mobs;
    bool isOpen = true;
};
using Shared = std::shared_ptr<Content>;

// An object that counts its references and has one interface.
template <class Interface>
class Counted : public aaf::NotImplemented<Interface> {
public:
    Counted() = default;
    Counted(const Counted&) = delete;
    Counted& operator=(const Counted&) = delete;
    HRESULT QueryInterface(REFIID, void** out) override {
        *out = nullptr;
        return NCF_E_NOINTERFACE;
    }
    ULONG AddRef() override { return ++references_; }
    ULONG Release() override {
        const ULONG left = --references_;
        if (left == 0) {
            delete this;
        }
        return left;
    }

protected:
    virtual ~Counted() = default;

private:
    std::atomic<ULONG> references_{1};
};

class MobObject final : public Counted<IAAFMob> {
public:
    explicit MobObject(const Mob& mob) : mob_(mob) {}
    HRESULT GetMobID(aafMobID_t* id) override {
        *id = mob_.id;
        return AAFRESULT_SUCCESS;
    }
    HRESULT CountSlots(aafNumSlots_t* count) override {
        *count = Is("description-slots") ? 0 : 1;
        return AAFRESULT_SUCCESS;
    }

private:
    Mob mob_;
};

class MobList final : public Counted<IEnumAAFMobs> {
public:
    explicit MobList(Shared content) : content_(std::move(content)) {}
    HRESULT NextOne(IAAFMob** mob) override {
        if (next_ == content_->mobs.size()) {
            return AAFRESULT_NO_MORE_OBJECTS;
        }
        *mob = new MobObject(content_->mobs[next_++]);
        return AAFRESULT_SUCCESS;
    }

private:
    Shared content_;
    std::size_t next_ = 0;
};

class Header final : public Counted<IAAFHeader> {
public:
    explicit Header(Shared content) : content_(std::move(content)) {}
    HRESULT CountMobs(aafMobKind_t kind, aafNumSlots_t* count) override {
        *count = 0;
        for (const Mob& mob : content_->mobs) {
            *count += mob.kind == kind || kind == kAAFAllMob ? 1 : 0;
        }
        return AAFRESULT_SUCCESS;
    }
    HRESULT GetMobs(aafSearchCrit_t*, IEnumAAFMobs** mobs) override {
        *mobs = new MobList(content_);
        return AAFRESULT_SUCCESS;
    }

private:
    Shared content_;
};

class File final : public Counted<IAAFFile> {
public:
    explicit File(Shared content) : content_(std::move(content)) {}
    HRESULT GetHeader(IAAFHeader** header) override {
        if (!content_->isOpen) {
            return AAFRESULT_NOT_OPEN;
        }
        *header = new Header(content_);
        return AAFRESULT_SUCCESS;
    }
    HRESULT Close() override {
        content_->isOpen = false;
        return AAFRESULT_SUCCESS;
    }

private:
    Shared content_;
};

// A number that stands for the beginning of a file and for its length.
std::uint64_t NumberOf(const std::filesystem::path& movie) {
    std::vector<char> bytes(1 << 20);
    std::ifstream stream(movie, std::ios::binary);
    stream.read(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    std::error_code ignored;
    std::uint64_t number = 0xCBF29CE484222325u ^ std::filesystem::file_size(movie, ignored);
    for (std::streamsize i = 0; i < stream.gcount(); ++i) {
        number = (number ^ static_cast<unsigned char>(bytes[static_cast<std::size_t>(i)])) *
                 0x100000001B3u;
    }
    return number;
}

aafMobID_t MobId(std::uint64_t number, aafMobKind_t kind) {
    if (Is("description-ids-stable")) {
        static std::uint64_t times = 0;
        number += ++times;
    }
    if (Is("description-ids-differ")) {
        number = 1;
    }
    if (Is("description-ids")) {
        kind = kAAFMasterMob;
    }
    aafMobID_t id{};
    id.instanceLow = static_cast<aafUInt8>(kind);
    std::memcpy(&id.material, &number, sizeof number);
    return id;
}

}  // namespace

IAAFFile* NewDescription(const std::filesystem::path& movie) {
    const std::uint64_t number = NumberOf(movie);
    auto content = std::make_shared<Content>();
    content->isOpen = !Is("description-is-aaf");
    for (const aafMobKind_t kind : {kAAFMasterMob, kAAFFileMob}) {
        if (kind != kAAFMasterMob || !Is("description-master-mob")) {
            content->mobs.push_back({MobId(number, kind), kind});
        }
    }
    return new File(content);
}

void CloseDescription(IAAFFile* file) {
    file->Close();
}

}  // namespace faulty
