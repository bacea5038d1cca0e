// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "fuzz/compound_writer/InputTree.h"

#include <algorithm>

namespace fuzz {

using compound::Node;

namespace {

constexpr int kDeepest = 50;
constexpr std::size_t kMostContent = 4 << 20;

class Steps {
public:
    Steps(const unsigned char* data, std::size_t size) : at_(data), end_(data + size) {}

    // 0 behind the end.
    std::uint8_t Byte() { return at_ == end_ ? 0 : *at_++; }

    void Fill(Node& storage, int depth) {
        while (at_ != end_) {
            const std::uint8_t step = Byte();
            const int kind = step & 3;
            if (kind == 1) {
                return;
            }
            const std::u16string name = Name(step >> 2);
            if (kind == 0) {
                Node contained = compound::Storage(name);
                contained.classId[0] = Byte();
                if (depth < kDeepest) {
                    Fill(contained, depth + 1);
                }
                storage.nodes.push_back(std::move(contained));
            } else {
                std::size_t size = Byte();
                size += kind == 3 ? Byte() * std::size_t{256} : 0;
                storage.nodes.push_back(compound::Stream(name, ContentOf(size)));
            }
        }
    }

private:
    // A character is one byte, or two behind 0xFF.
    std::u16string Name(std::size_t length) {
        std::u16string name;
        for (std::size_t i = 0; i < length; ++i) {
            const std::uint8_t first = Byte();
            name += first == 0xFF ? Unit() : char16_t{first};
        }
        return name;
    }
    char16_t Unit() {
        const int high = Byte();
        return static_cast<char16_t>(high << 8 | Byte());
    }
    compound::Bytes ContentOf(std::size_t size) {
        size = std::min(size, kMostContent - content_);
        content_ += size;
        return compound::Content(size);
    }

    const unsigned char* at_;
    const unsigned char* end_;
    std::size_t content_ = 0;  // of all streams so far
};

}  // namespace

InputTree::InputTree(const unsigned char* data, std::size_t size) {
    Steps steps(data, size);
    if (steps.Byte() % 2 != 0) {
        sectorSize = compound::SectorSize::Bytes4096;
    }
    steps.Fill(root, 0);
}

}  // namespace fuzz
