// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/AafComparison.h"

#include <fmt/format.h>

#include <algorithm>
#include <deque>
#include <map>
#include <tuple>

#include "host_interfaces/aaf/AAFEssenceData.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFObjects.h"
#include "reference_host/cliphost/AafTree.h"

namespace cliphost {
namespace {

using Kind = TreeDifference::Kind;

// An object of a file, which is read when it is compared.
struct Entry {
    ComparedObject about;
    host::Ref<IAAFObject> object;
    bool isMatched = false;
    const std::string* why = nullptr;  // nothing is known of what became of it
};

// The objects of a file in an order in which the mobs of a clip stand together.
class FileObjects {
public:
    explicit FileObjects(IAAFFile* file) {
        for (const host::Ref<IAAFMob>& mob : MobsOf(file)) {
            aafMobID_t id{};
            mob->GetMobID(&id);
            Add(mob.get(), ToText(id),
                TextOf(mob.get(), &IAAFMob::GetNameBufLen, &IAAFMob::GetName));
        }
        std::stable_sort(entries_.begin(), entries_.end(), [](const Entry& a, const Entry& b) {
            return a.about.name < b.about.name;
        });
        host::Ref<IAAFHeader> header;
        if (!file || file->GetHeader(header.Out()) < 0) {
            return;
        }
        header_ = As<IAAFObject>(header.get());
        host::Ref<IEnumAAFEssenceData> media;
        host::Ref<IAAFEssenceData> data;
        if (header->EnumEssenceData(media.Out()) < 0) {
            return;
        }
        while (media->NextOne(data.Out()) >= 0) {
            aafMobID_t id{};
            data->GetFileMobID(&id);
            Add(data.get(), ToText(id), "");
        }
    }

    std::vector<Entry>& entries() { return entries_; }
    TreeNode Read(const Entry& entry) { return reader_.Read(entry.object.get()); }
    TreeNode ReadHeader() { return header_ ? reader_.ReadAlone(header_.get()) : TreeNode(); }

    // What is known of an entry once its tree is read.
    static void Describe(const TreeNode& tree, ComparedObject& about) {
        about.kind = tree.title;
        for (const TreeNode::Branch& branch : tree.branches) {
            if (branch.name == "EssenceDescription" && !branch.nodes.empty()) {
                about.descriptor = branch.nodes.front().title;
            }
        }
    }

private:
    void Add(IUnknown* object, std::string id, std::string name) {
        if (auto one = As<IAAFObject>(object)) {
            Entry& entry = entries_.emplace_back();
            entry.about.id = std::move(id);
            entry.about.name = std::move(name);
            entry.about.kind = ClassOf(*one);
            entry.object = std::move(one);
        }
    }

    static std::string ClassOf(IAAFObject& object) {
        host::Ref<IAAFClassDef> definition;
        object.GetDefinition(definition.Out());
        const auto meta = As<IAAFMetaDefinition>(definition.get());
        return TextOf(meta.get(), &IAAFMetaDefinition::GetNameBufLen, &IAAFMetaDefinition::GetName);
    }

    host::Ref<IAAFObject> header_;
    std::vector<Entry> entries_;
    ObjectReader reader_{LongValues::Digested};
};

class FileComparison {
public:
    FileComparison(IAAFFile* before, IAAFFile* after, const TakeDifference& take,
                   const UnknownMobs& unknown)
        : before_(before),
          after_(after),
          take_(take),
          unknown_(unknown),
          trees_([this](const TreeDifference& one) {
              ++counts_.differences;
              take_(about_, one);
          }) {}

    ComparisonCounts Run() {
        MatchById();
        LeaveUnknown();
        MatchRest(
            [](const ComparedObject& one) { return Name(one.kind, one.name, one.descriptor); });
        if (pairs_.empty()) {  // files of one clip each
            MatchRest([](const ComparedObject& one) { return Name(one.kind, "", one.descriptor); });
        }
        CompareHeaders();
        for (const Entry& entry : before_.entries()) {
            const auto pair = pairs_.find(&entry);
            if (entry.why != nullptr) {
                TellUnknown(entry);
            } else if (pair == pairs_.end()) {
                TellWhole(before_, entry, Kind::Gone, counts_.gone);
            } else {
                ComparePair(entry, *pair->second);
            }
        }
        for (const Entry& entry : after_.entries()) {
            if (!entry.isMatched) {
                TellWhole(after_, entry, Kind::New, counts_.added);
            }
        }
        counts_.unread = trees_.unread();
        return counts_;
    }

private:
    using Name = std::tuple<std::string, std::string, std::string>;

    void Match(Entry& before, Entry& after) {
        before.isMatched = true;
        after.isMatched = true;
        pairs_[&before] = &after;
    }

    void MatchById() {
        std::map<Name, std::deque<Entry*>> there;
        const auto nameOf = [](const Entry& entry) {
            return Name(entry.about.kind, entry.about.id, "");
        };
        for (Entry& entry : after_.entries()) {
            there[nameOf(entry)].push_back(&entry);
        }
        for (Entry& entry : before_.entries()) {
            const auto found = there.find(nameOf(entry));
            if (found != there.end() && !found->second.empty()) {
                Match(entry, *found->second.front());
                found->second.pop_front();
            }
        }
    }

    void LeaveUnknown() {
        for (Entry& entry : before_.entries()) {
            const auto found = entry.isMatched ? unknown_.end() : unknown_.find(entry.about.id);
            if (found != unknown_.end()) {
                entry.why = &found->second;
            }
        }
    }

    // A movie that was written anew has other ids. Pairs those that are the only ones of their name
    // in both files.
    template <class NameOf>
    void MatchRest(const NameOf& nameOf) {
        std::map<Name, std::vector<Entry*>> there = NamesOfRest(after_, nameOf);
        for (const auto& [name, entries] : NamesOfRest(before_, nameOf)) {
            const auto found = there.find(name);
            if (found != there.end() && entries.size() == 1 && found->second.size() == 1) {
                Match(*entries.front(), *found->second.front());
                trees_.AddSame(entries.front()->about.id, found->second.front()->about.id);
            }
        }
    }

    template <class NameOf>
    static std::map<Name, std::vector<Entry*>> NamesOfRest(FileObjects& file,
                                                           const NameOf& nameOf) {
        std::map<Name, std::vector<Entry*>> names;
        for (Entry& entry : file.entries()) {
            if (!entry.isMatched && entry.why == nullptr) {
                FileObjects::Describe(file.Read(entry), entry.about);
                names[nameOf(entry.about)].push_back(&entry);
            }
        }
        return names;
    }

    void CompareHeaders() {
        about_ = {"Header", "", "", ""};
        trees_.Compare(before_.ReadHeader(), after_.ReadHeader());
    }

    void ComparePair(const Entry& before, const Entry& after) {
        const TreeNode old = before_.Read(before);
        const TreeNode now = after_.Read(after);
        about_ = before.about;
        FileObjects::Describe(old, about_);
        const std::size_t differences = counts_.differences;
        if (before.about.id != after.about.id) {
            TreeDifference other;
            other.property = "MobID";
            other.before = before.about.id;
            other.after = after.about.id;
            ++counts_.differences;
            take_(about_, other);
        }
        trees_.Compare(old, now);
        ++(counts_.differences == differences ? counts_.alike : counts_.changed);
    }

    void TellWhole(FileObjects& file, const Entry& entry, Kind kind, std::size_t& count) {
        about_ = entry.about;
        FileObjects::Describe(file.Read(entry), about_);
        TreeDifference difference;
        difference.kind = kind;
        (kind == Kind::Gone ? difference.before : difference.after) = about_.kind;
        ++count;
        ++counts_.differences;
        take_(about_, difference);
    }

    void TellUnknown(const Entry& entry) {
        about_ = entry.about;
        FileObjects::Describe(before_.Read(entry), about_);
        TreeDifference difference;
        difference.kind = Kind::Unknown;
        difference.before = about_.kind;
        difference.reason = *entry.why;
        ++counts_.unknown;
        take_(about_, difference);
    }

    FileObjects before_;
    FileObjects after_;
    const TakeDifference& take_;
    const UnknownMobs& unknown_;
    TreeComparison trees_;
    std::map<const Entry*, Entry*> pairs_;
    ComparedObject about_;  // whose differences are told
    ComparisonCounts counts_;
};

}  // namespace

std::string InWords(const ComparedObject& object) {
    std::string text = PropertyWords(object.kind);
    if (!object.name.empty()) {
        text += fmt::format(" \"{}\"", Shown(object.name));
    } else if (!object.id.empty()) {
        text += ' ' + object.id;
    }
    return object.descriptor.empty() ? text
                                     : fmt::format("{} ({})", text, Shown(object.descriptor));
}

ComparisonCounts CompareFiles(IAAFFile* before, IAAFFile* after, const TakeDifference& take,
                              const UnknownMobs& unknown) {
    return FileComparison(before, after, take, unknown).Run();
}

}  // namespace cliphost
