// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"

namespace cliphost {

// What a slot tells of a track.
struct SlotFacts {
    aafSlotID_t id = 0;
    std::string kind;         // "picture", or an id that nobody named
    aafRational_t rate{};     // 0/1 where the slot has none
    aafLength_t length = -1;  // -1 where it has none
};

// A clip of an AAF file, whoever made it: a master mob, and the source mobs that its slots lead to
// within the file. A source mob that no master mob leads to is a clip of its own where it says
// where media is.
struct AafClip {
    aafMobID_t id{};
    std::string name;
    // Its ids are made from the content of a movie, so that they tell whether a movie is the one.
    bool isOurs = false;
    std::vector<SlotFacts> slots;     // of the master mob
    std::vector<aafMobID_t> sources;  // the mobs that it leads to, itself if it is no master
    std::vector<std::string> urls;    // what their locators hold, each once
};

// What a slot holds: the id of its data definition, and a name for it where it has one, such as
// "picture"; else empty.
struct SlotData {
    aafUID_t id{};
    std::string kind;
};
SlotData DataOfSlot(IAAFMobSlot& slot);
// That name, of a data definition whose id is written so; empty where it has none.
std::string KindOfDataNamed(const std::string& id);

// In the order of their names; a file keeps its mobs in that of their ids.
std::vector<AafClip> ClipsOf(IAAFFile* file);

// The mob's bytes, to find it again by.
std::string KeyOf(const aafMobID_t& id);
// Whether both ids are those of mobs of one clip of ours.
bool IsOfSameClip(const aafMobID_t& a, const aafMobID_t& b);

// What tells the slots apart, such as "length 250 -> 251 in slot 1"; empty where nothing does.
std::string DifferencesOf(const std::vector<SlotFacts>& before,
                          const std::vector<SlotFacts>& after);

}  // namespace cliphost
