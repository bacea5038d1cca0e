// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Relink.h"

#include <fmt/format.h>

#include <algorithm>
#include <list>
#include <set>

#include "reference_host/cliphost/AafLocators.h"
#include "reference_host/cliphost/AafQuery.h"
#include "reference_host/cliphost/AafValue.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/MapOption.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/FileNumber.h"
#include "reference_host/system/OutputStream.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/FileUrl.h"
#include "reference_host/util/text/Printable.h"

namespace cliphost {
namespace {

using nlohmann::ordered_json;

enum class Relinked { InPlace, Linked, Cleaned, NotMatched, OtherMaker };
constexpr const char* kNamesOfRelinked[] = {"in place", "relinked", "cleaned", "not matched",
                                            "other maker"};

// What is done to the locators of a clip.
struct RelinkPlan {
    const CheckedClip* checked = nullptr;
    Relinked what = Relinked::InPlace;
    std::string url;                 // of the movie, for where no locator leads to it
    std::vector<std::string> found;  // places for strays, one each
    std::set<std::string> leads;     // locators that lead to it
    std::set<std::string> strays;    // locators that lead nowhere, or to another movie
};

bool IsStray(const ClipPlace& place) {
    return !place.hasContent &&
           (place.state == ClipState::Missing || place.state == ClipState::Changed);
}

RelinkPlan PlanOf(const CheckedClip& checked, PathMaps& maps) {
    RelinkPlan plan;
    plan.checked = &checked;
    for (const ClipPlace& place : checked.places) {
        if (place.hasContent) {
            plan.leads.insert(place.url);
        } else if (IsStray(place)) {
            plan.strays.insert(place.url);
        }
    }
    if (!checked.clip.isOurs) {
        plan.what = Relinked::OtherMaker;
        return plan;
    }
    // A clip that names no place gets one, too.
    const std::size_t needed = std::max<std::size_t>(plan.strays.size(), plan.leads.empty());
    for (std::size_t i = 0; i < std::min(needed, checked.found.size()); ++i) {
        plan.found.push_back(host::system::UrlOfPath(checked.found[i]));
        maps.MapToOther(plan.found.back());
        // Two folders here may be one there.
        if (plan.strays.erase(plan.found.back()) > 0) {
            plan.leads.insert(plan.found.back());
        }
    }
    plan.what = !plan.found.empty()   ? Relinked::Linked
                : plan.leads.empty()  ? Relinked::NotMatched
                : plan.strays.empty() ? Relinked::InPlace
                                      : Relinked::Cleaned;
    if (!plan.found.empty() || !plan.leads.empty()) {
        plan.url = plan.found.empty() ? *plan.leads.begin() : plan.found.front();
    }
    return plan;
}

// The locators of one descriptor.
class LocatorEdit {
public:
    LocatorEdit(IAAFFile* file, IAAFEssenceDescriptor& descriptor, const RelinkPlan& plan)
        : file_(file), descriptor_(descriptor), plan_(plan) {
        descriptor.CountLocators(&count_);
    }

    void Do() {
        const auto isStray = [&](const std::string& url) { return plan_.strays.count(url) != 0; };
        const auto leads = [&](const std::string& url) { return plan_.leads.count(url) != 0; };
        const bool isInPlace = count_ == 0 || Find(leads).has_value();
        std::size_t used = 0;
        for (std::optional<aafUInt32> stray; used < plan_.found.size() && (stray = Find(isStray));
             ++used) {
            SetPath(*LocatorAt(*stray), plan_.found[used]);
        }
        if (!isInPlace && used == 0) {
            // One that can't be checked gives way only where there is no other.
            const auto stray = Find(isStray);
            const auto kept =
                stray ? stray : Find([](const std::string& url) { return !url.empty(); });
            if (kept) {
                SetPath(*LocatorAt(*kept), plan_.url);
            } else {
                AppendLocator(file_, descriptor_, plan_.url);
            }
        }
        while (const std::optional<aafUInt32> stray = Find(isStray)) {
            if (descriptor_.RemoveLocatorAt(*stray) < 0) {
                throw Failure(kExitFile, host::system::PathOfText(PathOf(*LocatorAt(*stray))),
                              "the AAF library does not remove this locator");
            }
            --count_;
        }
    }

private:
    host::Ref<IAAFLocator> LocatorAt(aafUInt32 index) {
        host::Ref<IAAFLocator> locator;
        if (descriptor_.GetLocatorAt(index, locator.Out()) < 0) {
            throw Failure(kExitFile, "a locator can't be read");
        }
        return locator;
    }

    template <class Is>
    std::optional<aafUInt32> Find(const Is& is) {
        for (aafUInt32 i = 0; i < count_; ++i) {
            if (is(PathOf(*LocatorAt(i)))) {
                return i;
            }
        }
        return {};
    }

    IAAFFile* file_;
    IAAFEssenceDescriptor& descriptor_;
    const RelinkPlan& plan_;
    aafUInt32 count_ = 0;
};

void EditClip(IAAFFile* file, IAAFHeader& header, const RelinkPlan& plan) {
    const AafClip& clip = plan.checked->clip;
    for (const aafMobID_t& id : clip.sources) {
        host::Ref<IAAFMob> mob;
        // A clip may lead to the mobs of another maker, which stay as they are.
        if (!IsOfSameClip(clip.id, id) || header.LookupMob(id, mob.Out()) < 0) {
            continue;
        }
        ForEachDescriptorOf(*mob, [&](IAAFEssenceDescriptor& descriptor) {
            LocatorEdit(file, descriptor, plan).Do();
        });
    }
}

std::string Removed(std::size_t strays) {
    return fmt::format("{} removed that {} not lead to it", Counted(strays, "place"),
                       strays == 1 ? "does" : "do");
}

std::string LineOfPlan(const RelinkPlan& plan) {
    const CheckedClip& checked = *plan.checked;
    const ClipPlace* const place = checked.Telling();
    std::string line = host::text::PrintableLines(checked.clip.name);
    switch (plan.what) {
        case Relinked::Linked: {
            const std::size_t used = plan.found.size();
            for (std::size_t i = 0; i < checked.found.size(); ++i) {
                const std::filesystem::path& found = checked.found[i];
                line += (i == 0      ? " -> "
                         : i == used ? "; the same content is in "
                                     : ", ") +
                        host::DisplayPath(found);
                if (i < used && plan.found[i] != host::system::UrlOfPath(found)) {
                    line += ", written as " + plan.found[i];
                }
            }
            if (plan.strays.size() > used) {
                line += "; " + Removed(plan.strays.size() - used);
            }
            return line + "\n";
        }
        case Relinked::Cleaned:
            return line + ": " + Removed(plan.strays.size()) + "\n";
        case Relinked::NotMatched:
            line += ": not matched: no movie in the folders has its content";
            return line + (place && !place->reason.empty()
                               ? fmt::format("; {}: {}\n", host::text::PrintableLines(place->url),
                                             host::text::PrintableLines(place->reason))
                               : "\n");
        case Relinked::InPlace:
            return place && place->state == ClipState::Changed
                       ? line + ": in its place, but described otherwise now: " + place->reason +
                             "\n"
                       : "";
        case Relinked::OtherMaker:
            break;
    }
    return "";
}

ordered_json JsonOfPlan(const RelinkPlan& plan) {
    const CheckedClip& checked = *plan.checked;
    ordered_json json = {{"name", checked.clip.name},
                         {"id", ToText(checked.clip.id)},
                         {"state", kNamesOfRelinked[static_cast<int>(plan.what)]},
                         {"url", plan.url.empty() ? ordered_json() : ordered_json(plan.url)},
                         {"strays", plan.strays},
                         {"found", ordered_json::array()}};
    for (const std::filesystem::path& path : checked.found) {
        json["found"].push_back(MachinePath(path));
    }
    return json;
}

// What is no AAF file may be a movie that nobody had to look at.
void RefuseOutputOntoOther(const AafLibrary& library, const std::filesystem::path& output) {
    std::error_code ignored;
    if (!std::filesystem::is_regular_file(output, ignored) ||
        std::filesystem::file_size(output, ignored) == 0 || OutputFile::IsDevice(output)) {
        return;
    }
    try {
        library.Open(output);
    } catch (const Failure&) {
        throw Failure(kExitCaller, output, "there is a file that is no AAF file",
                      "name another, or remove it");
    }
}

}  // namespace

int Relink(Session& session, RelinkOptions& options) {
    session.aaf().TryToSave(options.output);
    ClipCheck check(session, options.check);
    std::list<CheckedClip> clips;
    std::vector<CheckedClip*> all;
    for (AafClip& clip : ClipsOf(session.aaf().Open(options.file).get())) {
        CheckedClip& placed = clips.emplace_back(check.Place(std::move(clip)));
        all.push_back(&placed);
    }
    check.Check(all);
    const bool isThere = host::system::NumberOf(options.output).has_value();
    for (const auto& [movie, facts] : check.movies()) {
        if (isThere) {
            RefuseOutputOntoMovie(options.output, movie);
        }
    }
    RefuseOutputOntoOther(session.aaf(), options.output);

    std::vector<RelinkPlan> plans;
    std::size_t counts[std::size(kNamesOfRelinked)] = {};
    for (const CheckedClip& clip : clips) {
        plans.push_back(PlanOf(clip, options.check.maps));
        ++counts[static_cast<int>(plans.back().what)];
    }
    const auto count = [&](Relinked what) { return counts[static_cast<int>(what)]; };
    if (count(Relinked::Linked) + count(Relinked::Cleaned) == 0) {
        session.aaf().SaveAsItIs(options.file, options.output);
    } else {
        session.aaf().SaveEdited(options.file, options.output, [&](IAAFFile* file) {
            host::Ref<IAAFHeader> header;
            if (file->GetHeader(header.Out()) < 0) {
                throw Failure(kExitFile, options.file, "its header can't be read");
            }
            for (const RelinkPlan& plan : plans) {
                if (plan.what == Relinked::Linked || plan.what == Relinked::Cleaned) {
                    EditClip(file, *header, plan);
                }
            }
        });
    }

    int status = count(Relinked::NotMatched) > 0 ? kExitFile : kExitFine;
    if (!clips.empty()) {
        for (const Failure& unused :
             UnusedMaps(options.check.maps,
                        "give FROM as the folders begin in which movies are, "
                        "or TO as the locators in the file begin")) {
            status = std::max(status, unused.status());
            TellProblem(unused.problem(), session.verbosity());
        }
    }
    if (options.json) {
        ordered_json answer = {{"aaf", MachinePath(options.file)},
                               {"output", MachinePath(options.output)},
                               {"clips", ordered_json::array()},
                               {"counts", {{"clips", plans.size()}}}};
        for (const RelinkPlan& plan : plans) {
            answer["clips"].push_back(JsonOfPlan(plan));
        }
        for (std::size_t i = 0; i < std::size(counts); ++i) {
            answer["counts"][kNamesOfRelinked[i]] = counts[i];
        }
        PrintJson(schema::kRelink, std::move(answer));
        return status;
    }
    std::string text;
    for (const RelinkPlan& plan : plans) {
        text += LineOfPlan(plan);
    }
    const std::string others = count(Relinked::OtherMaker) == 0
                                   ? ""
                                   : fmt::format(", {} of other makers untouched",
                                                 Counted(count(Relinked::OtherMaker), "clip"));
    const std::string unread = check.unreadable() == 0
                                   ? ""
                                   : fmt::format("; {} in the folders could not be described",
                                                 Counted(check.unreadable(), "file"));
    const std::size_t done = count(Relinked::Linked) + count(Relinked::Cleaned);
    text += fmt::format(
        "{}: {}, {} not matched, {} in place{}{}\n", host::DisplayPath(options.output),
        done == 0 ? "nothing to relink, written as it was" : Counted(done, "clip") + " relinked",
        count(Relinked::NotMatched), count(Relinked::InPlace), others, unread);
    if (host::system::IsStandardOutput(options.output)) {
        Notice("{}", text);
    } else {
        fmt::print("{}", text);
    }
    return status;
}

}  // namespace cliphost
