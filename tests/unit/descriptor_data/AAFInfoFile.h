// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include "source/descriptor_data/AAFInfoDataContainerReader2.h"
#include "source/descriptor_data/ParseAAFInfoXML.h"
#include "tests/unit/descriptor_data/DataHost.h"

// Loads descriptor data that a test writes down, through the host's parser.
class AAFInfoFile : public DataHost {
protected:
    // Wraps the entries in a document.
    static std::string Document(const std::string& entries) {
        return "<?xml version=\"1.0\"?>\n<Infos>\n" + entries + "</Infos>\n";
    }
    // One entry: its id, its kind such as "CDCI", and what its descriptor holds.
    static std::string Entry(const std::string& id, const std::string& kind,
                             const std::string& values) {
        return "<MediaDescriptorSignature><NivoInfo><ResolutionID>" + id +
               "</ResolutionID></NivoInfo><groups:" + kind + "Descriptor>" + values +
               "</groups:" + kind + "Descriptor></MediaDescriptorSignature>\n";
    }
    static std::string Value(const std::string& name, const std::string& value) {
        return "<rp210:" + name + ">" + value + "</rp210:" + name + ">";
    }
    static std::string Size(int width, int height) {
        return Value("StoredWidth", std::to_string(width)) +
               Value("StoredHeight", std::to_string(height));
    }
    void Load(const std::string& entries) {
        ParseAAFInfoXML(host.factory(), &container_,
                        NMAString(Write("AAFInfo.xml", Document(entries)).c_str()));
    }
    // A reader of one id.
    struct Reader : AAFInfoDataContainerReader2 {
        Reader(const AAFInfoFile& file, ncfUInt32 width, ncfUInt32 height, ncfUInt32 vcid = 1)
            : AAFInfoDataContainerReader2(&file.container_, vcid, Rational{25, 1}, width, height) {}
    };

    GenericXMLDataContainer container_;
};
