// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Arbitrary bytes as either data file: read by the host's parser and the
// module's readers, then every question is asked of every entry. As both files
// at once they are checked for mistakes.

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <ostream>
#include <set>

#include "fuzz/support/RunLimits.h"
#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/data_check/DataCheck.h"
#include "reference_host/framework/Host.h"
#include "reference_host/xml/RegisterXmlComponents.h"
#include "source/descriptor_data/AAFInfoFields.h"
#include "source/descriptor_data/FourCharDataContainerReader.h"
#include "source/descriptor_data/GenericDocHandler.h"
#include "source/descriptor_data/IGenericDocHandler.h"
#include "source/descriptor_data/ParseAAFInfoXML.h"
#include "source/plugin/Rational.h"
#include "source/plugin/TextToNumber.h"
#include "tests/support/TestFolder.h"

namespace {

INCFComponentFactory* Factory() {
    static host::Host* const host = [] {
        auto* const made = new host::Host;
        host::RegisterXmlComponents(*made);
        made->RegisterComponent(kCLSID_GenericDocHandler,
                                CreateInstanceOf<NMA::Impl::GenericDocHandler>);
        NMAInitialize(&made->factory());
        return made;
    }();
    return &host->factory();
}

// One folder for the whole run, deleted at its end.
const TestFolder& TheFolder() {
    static const TestFolder folder;
    return folder;
}

const NMAString& TheFile(const std::uint8_t* data, std::size_t size) {
    static const std::filesystem::path path = TheFolder() / data_check::kDataFileNames[0];
    static const NMAString name(path.c_str());
    std::ofstream(path, std::ios::binary)
        .write(reinterpret_cast<const char*>(data), static_cast<std::streamsize>(size));
    return name;
}

void CheckAsBoth() {
    static const bool isLinked = [] {
        std::filesystem::create_symlink(TheFolder() / data_check::kDataFileNames[0],
                                        TheFolder() / data_check::kDataFileNames[1]);
        return true;
    }();
    const data_check::CheckedData checked = data_check::CheckData(TheFolder().path());
    // Each finding stands somewhere, and says what helps.
    for (const data_check::Finding& finding : checked.findings) {
        if (!isLinked || finding.place.line < 1 || finding.place.column < 1 ||
            finding.what.empty() || finding.hint.empty()) {
            std::abort();
        }
    }
}

void AskAll(const GenericXMLDataContainer& infos, ncfUInt32 id, ncfUInt32 width) {
    AAFInfoDataContainerReader2 reader(&infos, id, Rational{25, 1}, width, 1080);
    AAFInfo info;
    const char* failedCall = nullptr;
    bool isRGBA = false;
    if (reader.IsDescriptorRGBA(&isRGBA) >= 0) {
        reader.GetPixelLayoutFromVCID(&info.pixelLayout);
        ReadPictureFields(reader, isRGBA, info, &failedCall);
        ReadMPEG2Fields(reader, info, &failedCall);
    }
}

void ReadInfos(const NMAString& file) {
    GenericXMLDataContainer infos;
    ParseAAFInfoXML(Factory(), &infos, file);
    std::ostream nowhere(nullptr);
    infos.Dump(nowhere);
    std::set<ncfUInt32> ids;
    for (const auto& entry : infos.AllEntries()) {
        ids.insert(TextToNumber(entry.first->ValueText()));
    }
    for (const ncfUInt32 id : ids) {
        AskAll(infos, id, 0);
        AskAll(infos, id, 1920);
    }
}

void ReadMapper(const NMAString& file) {
    const FourCharDataContainerReader mapper(Factory(), file);
    const Rational rate{25, 1};
    const ncfUInt8 layout = 0;
    std::set<ncfUInt32> codes;
    for (const auto& entry : mapper.AllEntries()) {
        ncfUInt32 code = 0;
        const std::string text = entry.first->ValueText();
        text.copy(reinterpret_cast<char*>(&code), sizeof code);
        codes.insert(code);
    }
    for (const ncfUInt32 code : codes) {
        ncfUInt32 id = 0;
        mapper.GetVCID(code, 1920, 1080, &rate, &layout, code, &id);
        mapper.GetVCIDByFourChar(code, &id);
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const fuzz::TimeLimit limit;
    Factory();
    const NMAString& file = TheFile(data, size);
    for (void (*read)(const NMAString&) : {ReadInfos, ReadMapper}) {
        try {
            read(file);
        } catch (NCFRESULT) {
            // a file that can't be read
        }
    }
    CheckAsBoth();
    return 0;
}
