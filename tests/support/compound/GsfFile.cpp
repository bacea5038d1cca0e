// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/support/compound/GsfFile.h"

#include <gsf/gsf-infile-msole.h>
#include <gsf/gsf-infile.h>
#include <gsf/gsf-input-memory.h>
#include <gsf/gsf-outfile-msole.h>
#include <gsf/gsf-outfile.h>
#include <gsf/gsf-output-memory.h>
#include <gsf/gsf-utils.h>

#include <memory>
#include <stdexcept>

namespace gsf {

using compound::Bytes;
using compound::Node;

namespace {

struct LetGo {
    void operator()(void* object) const { g_object_unref(object); }
};
template <class Object>
using Held = std::unique_ptr<Object, LetGo>;

template <class Object>
Held<Object> Hold(Object* object, const std::string& what) {
    if (object == nullptr) {
        throw std::runtime_error("libgsf: " + what);
    }
    return Held<Object>(object);
}

// What is null when an operation went well.
std::string ReasonIn(GError* error) {
    const std::unique_ptr<GError, decltype(&g_error_free)> held(error, g_error_free);
    return held ? held->message : "no reason";
}

void SetUp() {
    static const bool isSetUp = [] {
        gsf_init();
        return true;
    }();
    static_cast<void>(isSetUp);
}

std::u16string Name(const char* utf8) {
    glong length = 0;
    const std::unique_ptr<gunichar2, decltype(&g_free)> units(
        g_utf8_to_utf16(utf8, -1, nullptr, &length, nullptr), g_free);
    if (!units) {
        throw std::runtime_error("libgsf: a name that is not UTF-8");
    }
    return {units.get(), units.get() + length};
}

std::string Utf8(const std::u16string& name) {
    const std::unique_ptr<char, decltype(&g_free)> text(
        g_utf16_to_utf8(reinterpret_cast<const gunichar2*>(name.data()),
                        static_cast<glong>(name.size()), nullptr, nullptr, nullptr),
        g_free);
    if (!text) {
        throw std::runtime_error("libgsf: a name that is not UTF-16");
    }
    return text.get();
}

Bytes ContentOf(GsfInput* input) {
    Bytes content(static_cast<std::size_t>(gsf_input_size(input)));
    if (!content.empty() && gsf_input_read(input, content.size(), content.data()) == nullptr) {
        throw std::runtime_error("libgsf: a stream that can't be read");
    }
    return content;
}

Node NodeOf(GsfInput* input, const std::u16string& name) {
    GsfInfile* const storage = GSF_INFILE(input);
    const int count = gsf_infile_num_children(storage);
    if (count < 0) {
        return compound::Stream(name, ContentOf(input));
    }
    Node node = compound::Storage(name);
    if (!gsf_infile_msole_get_class_id(GSF_INFILE_MSOLE(input), node.classId.data())) {
        throw std::runtime_error("libgsf: a storage without a class");
    }
    for (int i = 0; i < count; ++i) {
        const Held<GsfInput> contained =
            Hold(gsf_infile_child_by_index(storage, i), "a storage or stream that can't be opened");
        node.nodes.push_back(NodeOf(contained.get(), Name(gsf_infile_name_by_index(storage, i))));
    }
    return node;
}

void Write(GsfOutfile* storage, const Named& named) {
    const compound::StoredAuid none{};
    if (named.node.classId != none) {
        gsf_outfile_msole_set_class_id(GSF_OUTFILE_MSOLE(storage), named.node.classId.data());
    }
    for (const Named& contained : named.nodes) {
        const Node& node = contained.node;
        const Held<GsfOutput> output =
            Hold(gsf_outfile_new_child(storage, contained.name.c_str(), node.isStorage),
                 "a storage or stream that can't be made");
        if (node.isStorage) {
            Write(GSF_OUTFILE(output.get()), contained);
        } else {
            gsf_output_write(output.get(), node.content.size(), node.content.data());
        }
        gsf_output_close(output.get());
    }
}

Held<GsfOutput> InMemory(const Named& root, compound::SectorSize sectorSize) {
    SetUp();
    Held<GsfOutput> sink = Hold(gsf_output_memory_new(), "no memory");
    const Held<GsfOutfile> outfile =
        Hold(gsf_outfile_msole_new_full(sink.get(), static_cast<guint>(sectorSize), 64),
             "no file can be made");
    Write(outfile.get(), root);
    if (!gsf_output_close(GSF_OUTPUT(outfile.get()))) {
        throw std::runtime_error("libgsf: the file can't be written");
    }
    return sink;
}

}  // namespace

Node Read(const Bytes& file) {
    SetUp();
    const Held<GsfInput> input = Hold(
        gsf_input_memory_new(file.data(), static_cast<gsf_off_t>(file.size()), FALSE), "no memory");
    GError* error = nullptr;
    GsfInfile* const opened = gsf_infile_msole_new(input.get(), &error);
    const Held<GsfInfile> infile = Hold(opened, opened ? "" : ReasonIn(error));
    return NodeOf(GSF_INPUT(infile.get()), u"");
}

Bytes Written(const Node& root, compound::SectorSize sectorSize) {
    const Held<GsfOutput> sink = InMemory(Named(root), sectorSize);
    const guint8* const bytes = gsf_output_memory_get_bytes(GSF_OUTPUT_MEMORY(sink.get()));
    return {bytes, bytes + gsf_output_size(sink.get())};
}

Named::Named(const Node& wanted)
    : node(wanted), name(Utf8(wanted.name)), nodes(wanted.nodes.begin(), wanted.nodes.end()) {}

std::size_t SizeWritten(const Named& root, compound::SectorSize sectorSize) {
    return static_cast<std::size_t>(gsf_output_size(InMemory(root, sectorSize).get()));
}

}  // namespace gsf
