// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <set>

#include "reference_host/framework/HostPath.h"
#include "reference_host/util/text/HostText.h"
#include "reference_host/validate/Media.h"

namespace validate {
namespace {

void ClaimsAFolder(Trial& trial) {
    Containers containers(trial, 0);  // a module without them has volumes of something else
    const auto volumes = MediaOf<NMA::IMediaVolume>(containers.module(), "volume");
    WriteSoundMovies(containers.folder());
    const auto path = host::ModulePath(containers.folder());
    trial.Doing("calling IsMediaVolume with a folder of sound movies");
    NCFRESULT result = 0;
    for (std::size_t i = 0; i < volumes.size() && result != 1; ++i) {
        result = volumes[i].object->IsMediaVolume(path.get());
    }
    trial.ExpectResult(1, result, "1, since the module's container claims *.mov");
}

void ClaimsAFolderEachTime(Volumes& volumes) {
    Trial& trial = volumes.trial();
    for (int round = 2; round <= 20; ++round) {
        trial.Doing("calling IsMediaVolume with the same folder, time " + std::to_string(round));
        trial.Expect(volumes.Claims(volumes.folder()), "1, as the first time", "0");
    }
}

void LeavesOtherFolders(Volumes& volumes) {
    Trial& trial = volumes.trial();
    const std::filesystem::path empty = volumes.scratch() / "empty";
    MakeFolder(empty);
    trial.Doing("calling IsMediaVolume with an empty folder");
    trial.Expect(!volumes.Claims(empty), "0", "1");
    trial.Doing("calling IsMediaVolume with a folder that is not there");
    trial.Expect(!volumes.Claims(volumes.scratch() / "absent"), "0", "1");
    trial.Doing("calling IsMediaVolume with a movie instead of a folder");
    trial.Expect(!volumes.Claims(volumes.movies()[0].file), "0", "1");
}

void VolumeRefusesNullPaths(Trial& trial, NMA::IMediaVolume& volume) {
    trial.Doing("calling IsMediaVolume with null for the path");
    trial.ExpectResult(0, volume.IsMediaVolume(nullptr), "0, whatever happens");
    trial.Doing("calling GetVolumeInfo with null for the path");
    host::Ref<NMA::IVolumeInfo> info;
    trial.ExpectRefusal(volume.GetVolumeInfo(nullptr, info.Out()));
    trial.Doing("calling GetMediaFormat with null for the path");
    host::Ref<NMA::IMediaFormat> format;
    trial.ExpectRefusal(volume.GetMediaFormat(nullptr, format.Out()));
}

void VolumeRefusesNullOutputs(Trial& trial, Volumes& volumes) {
    const auto path = host::ModulePath(volumes.folder());
    NMA::IMediaVolume& volume = *volumes.volume();
    trial.Doing("calling GetVolumeInfo with null for the output");
    trial.ExpectRefusal(volume.GetVolumeInfo(path.get(), nullptr));
    trial.Doing("calling GetMediaFormat with null for the output");
    trial.ExpectRefusal(volume.GetMediaFormat(path.get(), nullptr));
    trial.Doing("calling GetContainerComponentId with null for the output");
    trial.ExpectRefusal(volume.GetContainerComponentId(nullptr));
    host::Ref<NMA::IVolumeInfo> info;
    trial.ExpectSuccess(volume.GetVolumeInfo(path.get(), info.Out()));
    trial.Doing("asking a volume for type, serial number, label and date with null for the output");
    trial.ExpectRefusal(info->GetType(nullptr));
    trial.ExpectRefusal(info->GetSerialNumber(nullptr));
    trial.ExpectRefusal(info->GetLabel(nullptr));
    trial.ExpectRefusal(info->GetModificationDate(nullptr));
    host::Ref<NMA::IMediaFormat> format;
    trial.ExpectSuccess(volume.GetMediaFormat(path.get(), format.Out()));
    trial.Doing("asking a folder's format for its clips with null for the output");
    trial.ExpectRefusal(format->GetAAFClips(nullptr));
    const auto clips = volumes.ClipsOf(volumes.folder());
    trial.Doing("asking a folder's list for path and description with null for the output");
    trial.ExpectRefusal(clips->GetClipPath(0, nullptr));
    trial.ExpectRefusal(clips->GetMetadata(0, nullptr));
}

void VolumeRefusesNull(Volumes& volumes) {
    Trial& trial = volumes.trial();
    VolumeRefusesNullPaths(trial, *volumes.volume());
    VolumeRefusesNullOutputs(trial, volumes);
}

void TellsOfAFolder(Volumes& volumes) {
    Trial& trial = volumes.trial();
    trial.Doing("calling GetVolumeInfo with a folder of movies");
    const auto path = host::ModulePath(volumes.folder());
    host::Ref<NMA::IVolumeInfo> info;
    trial.ExpectSuccess(volumes.volume()->GetVolumeInfo(path.get(), info.Out()));
    trial.Expect(static_cast<bool>(info), "an object", "null");
    trial.Doing("asking a volume for its type");
    ncfUInt32 type = 0;
    trial.ExpectSuccess(info->GetType(&type));
    trial.Expect(type == 0 || (type >= 2 && type <= 4), "0, 2, 3 or 4", std::to_string(type));
    trial.Doing("asking a volume for its serial number and label");
    ncfUInt32 serial = 0;
    trial.ExpectSuccess(info->GetSerialNumber(&serial));
    host::Ref<INCFString> label;
    trial.ExpectSuccess(info->GetLabel(label.Out()));
    trial.Expect(static_cast<bool>(label), "a string, which may be empty", "null");
    trial.Doing("asking a volume for the date of its newest movie");
    ncfUInt32 date = 0;
    trial.ExpectSuccess(info->GetModificationDate(&date));
    trial.Expect(date != 0, "a date, since there are movies", "0");
}

void FormatListsClips(Volumes& volumes) {
    Trial& trial = volumes.trial();
    trial.Doing("listing the clips of a folder of movies");
    const auto clips = volumes.ClipsOf(volumes.folder());
    trial.Expect(clips->GetCount() >= 1, "one clip at least, since the folder is claimed",
                 std::to_string(clips->GetCount()));
}

std::filesystem::path PathOfClip(Trial& trial, NMA::IAAFClips* clips, ncfSInt32 index) {
    host::Ref<host::String> text = host::MakeRef<host::String>();
    trial.ExpectSuccess(clips->GetClipPath(index, text.get()));
    std::filesystem::path path;
    trial.ExpectSuccess(host::PathFrom(text.get(), path), "a path");
    return path;
}

void ClipsAreTheFoldersFiles(Volumes& volumes) {
    Trial& trial = volumes.trial();
    const auto clips = volumes.ClipsOf(volumes.folder());
    std::set<std::filesystem::path> files;
    for (const SampleMovie& movie : volumes.movies()) {
        files.insert(movie.file);
    }
    for (ncfSInt32 i = 0; i < clips->GetCount(); ++i) {
        trial.Doing("asking for the path of clip " + std::to_string(i));
        const std::filesystem::path path = PathOfClip(trial, clips.get(), i);
        trial.Expect(files.erase(path) == 1, "each clip is another file of the folder",
                     host::DisplayPath(path));
    }
}

void ListRefusesOtherIndexes(Volumes& volumes) {
    Trial& trial = volumes.trial();
    const auto clips = volumes.ClipsOf(volumes.folder());
    for (const ncfSInt32 index : {clips->GetCount(), -1, 0x7FFFFFFF}) {
        trial.Doing("asking a folder's list for clip " + std::to_string(index) + " of " +
                    std::to_string(clips->GetCount()));
        host::Ref<IAAFFile> file;
        trial.ExpectResult(NCF_E_NOTFOUND, clips->GetMetadata(index, file.Out()), "NCF_E_NOTFOUND");
        trial.Expect(!file, "no description comes out", "an object");
    }
}

void ListDescribesClips(Volumes& volumes) {
    Trial& trial = volumes.trial();
    const auto clips = volumes.ClipsOf(volumes.folder());
    for (ncfSInt32 i = 0; i < clips->GetCount(); ++i) {
        trial.Doing("asking a folder's list for the description of clip " + std::to_string(i));
        host::Ref<IAAFFile> file;
        const NCFRESULT result = clips->GetMetadata(i, file.Out());
        trial.Expect((result >= 0) == static_cast<bool>(file),
                     "a description with success, or null with a failure",
                     trial.Text(result) + (file ? ", and an object" : ", and null"));
    }
}

void ContainerIdLeadsToAContainer(Volumes& volumes) {
    Trial& trial = volumes.trial();
    trial.Doing("calling GetContainerComponentId");
    GUID id{};
    trial.ExpectSuccess(volumes.volume()->GetContainerComponentId(&id));
    for (const host::ComponentFacts& component : volumes.module().Components()) {
        if (component.id != id) {
            continue;
        }
        const auto factory = FactoryOf(volumes.module(), component);
        trial.Expect(static_cast<bool>(factory), "a component that has a class factory",
                     component.name + " has none");
        void* out = nullptr;
        factory->CreateInstance(volumes.module().unknown(), nullptr, NMA::IID_IMediaContainer,
                                &out);
        const auto made = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out));
        trial.Expect(static_cast<bool>(made), "a component that is an IMediaContainer",
                     component.name + " is none");
        return;
    }
    trial.Fail("the component id of one of the module's components", "an id that none has");
}

void GoesOnWithBadFiles(Volumes& volumes) {
    Trial& trial = volumes.trial();
    const std::filesystem::path folder = volumes.scratch() / "bad";
    MakeFolder(folder);
    WriteBrokenMovies(folder);
    WriteHostileMovies(folder);
    trial.Doing("listing a folder of broken and hostile files");
    const bool isClaimed = volumes.Claims(folder);
    if (!isClaimed) {
        return;  // it looks into the files, and finds no clip
    }
    const auto clips = volumes.ClipsOf(folder);
    for (ncfSInt32 i = 0; i < clips->GetCount(); ++i) {
        trial.Doing("describing " +
                    host::DisplayPath(PathOfClip(trial, clips.get(), i).filename()) +
                    " from a folder's list");
        host::Ref<IAAFFile> file;
        const NCFRESULT result = clips->GetMetadata(i, file.Out());
        trial.Expect((result >= 0) == static_cast<bool>(file),
                     "a description with success, or null with a failure",
                     trial.Text(result) + (file ? ", and an object" : ", and null"));
    }
}

// Lists a folder as far as the host lets the module.
void ListAnyway(Trial& trial, Volumes& volumes) {
    const auto path = host::ModulePath(volumes.folder());
    volumes.Claims(volumes.folder());
    host::Ref<NMA::IVolumeInfo> info;
    const bool hasInfo = volumes.volume()->GetVolumeInfo(path.get(), info.Out()) >= 0;
    trial.Expect(!hasInfo || info, "an info with success", "null");
    host::Ref<INCFString> label;
    const bool hasLabel = hasInfo && info->GetLabel(label.Out()) >= 0;
    trial.Expect(!hasLabel || label, "a label with success", "null");
    host::Ref<NMA::IMediaFormat> format;
    const bool hasFormat = volumes.volume()->GetMediaFormat(path.get(), format.Out()) >= 0;
    trial.Expect(!hasFormat || format, "a format with success", "null");
    host::Ref<NMA::IAAFClips> clips;
    const bool hasClips = hasFormat && format->GetAAFClips(clips.Out()) >= 0;
    trial.Expect(!hasClips || clips, "a list with success", "null");
}

template <Refused refused>
void ListingRefused(Volumes& volumes) {
    Trial& trial = volumes.trial();
    const ncfSInt32 before = volumes.ClipsOf(volumes.folder())->GetCount();
    RefuseEach(
        volumes.module(), refused,
        [&](int number) {
            trial.Doing(std::string("listing a folder while the host refuses ") + WordOf(refused) +
                        " " + std::to_string(number));
        },
        [&] { ListAnyway(trial, volumes); });
    trial.Doing("listing a folder after the host has refused something");
    trial.Expect(volumes.Claims(volumes.folder()), "1, as before the refusals", "0");
    const ncfSInt32 after = volumes.ClipsOf(volumes.folder())->GetCount();
    trial.Expect(after == before, "as many clips as before the refusals", std::to_string(after));
}

void ListOutlivesVolume(Volumes& volumes) {
    Trial& trial = volumes.trial();
    const auto clips = volumes.ClipsOf(volumes.folder());
    volumes.Release();
    trial.Doing("using a folder's list after its volume's end");
    trial.Expect(clips->GetCount() >= 1, "its clips are still there",
                 std::to_string(clips->GetCount()));
}

}  // namespace

std::vector<Check> VolumeChecks() {
    static constexpr char kPair[] = "the output is set before the last step has succeeded";
    return {
        {"volume-claims", "A volume claims a folder of movies that the module's container claims.",
         "the folder's entries are compared in another case, or the path is not understood",
         ClaimsAFolder},
        {"volume-claims-again", "A volume says the same of a folder each time.",
         "the first answer is kept, or changes something", OfEachVolume<ClaimsAFolderEachTime>},
        {"volume-other-folders",
         "A volume answers 0 for an empty folder, for one that is not there and for a file.",
         "a failure is handed on instead of 0, or the folder is not looked into",
         OfEachVolume<LeavesOtherFolders>},
        {"volume-null-arguments",
         "A volume and what it hands out refuse null for a path and for an output.",
         "the argument is used before it is looked at", OfEachVolume<VolumeRefusesNull>},
        {"volume-info",
         "A claimed folder has a volume info with type, serial number, label and date.",
         "an output is left as it was", OfEachVolume<TellsOfAFolder>},
        {"volume-format", "A claimed folder has a format that lists one clip at least.",
         "the claim and the list go by different rules", OfEachVolume<FormatListsClips>},
        {"volume-clip-paths", "Each clip of a folder's list is another file of that folder.",
         "paths are joined with another separator than a backslash, or a file is listed twice",
         OfEachVolume<ClipsAreTheFoldersFiles>},
        {"volume-clip-index",
         "A folder's list refuses an index that is not there with NCF_E_NOTFOUND.",
         "the index is not compared, or as an unsigned number",
         OfEachVolume<ListRefusesOtherIndexes>},
        {"volume-clip-descriptions",
         "A folder's list gives a description with success, and null with a failure.", kPair,
         OfEachVolume<ListDescribesClips>},
        {"volume-container-id",
         "GetContainerComponentId names a component of the module that is a container.",
         "it gives the class id, or the id of another component",
         OfEachVolume<ContainerIdLeadsToAContainer>},
        {"volume-bad-files",
         "A folder with broken and hostile files is listed, and each of them refused or "
         "described.",
         "what stands in a file is used before it is looked at", OfEachVolume<GoesOnWithBadFiles>},
        {"volume-creations-refused",
         "When the host refuses to make the n-th component that listing a folder asks for, for "
         "every n, the folder is listed or refused, and the next one works.",
         kPair, OfEachVolume<ListingRefused<Refused::kCreations>>},
        {"volume-queries-refused",
         "When the host refuses the n-th interface that listing a folder asks for, for every n, "
         "the folder is listed or refused, and the next one works.",
         kPair, OfEachVolume<ListingRefused<Refused::kQueries>>},
        {"volume-released-first", "A folder's list goes on when its volume is released.",
         "the list points into the volume or the format", OfEachVolume<ListOutlivesVolume>},
    };
}

}  // namespace validate
