// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/PlacedDocument.h"

#include "reference_host/xml/InputFile.h"

namespace host {

namespace {

bool IsSpace(char c) {
    return c == ' ' || c == '\t' || c == '\r' || c == '\n';
}

// Walks through the bytes of a tag and knows where it is.
class TagWalk {
public:
    TagWalk(std::string_view bytes, XmlPlace place) : bytes_(bytes), place_(place) {}

    XmlPlace place() const { return place_; }
    void SkipWhile(bool (*fits)(char)) {
        while (at_ < bytes_.size() && fits(bytes_[at_])) {
            Step();
        }
    }
    // Behind the next one of these characters, which it gives; 0 where there is none.
    char SkipBehind(std::string_view ends) {
        while (at_ < bytes_.size()) {
            const char c = bytes_[at_];
            Step();
            if (ends.find(c) != std::string_view::npos) {
                return c;
            }
        }
        return '\0';
    }

private:
    void Step() {
        const char c = bytes_[at_++];
        const bool endsLine =
            c == '\n' || (c == '\r' && (at_ == bytes_.size() || bytes_[at_] != '\n'));
        const bool isInsideCharacter = (static_cast<unsigned char>(c) & 0xC0) == 0x80;
        if (endsLine) {
            ++place_.line;
            place_.column = 1;
        } else if (!isInsideCharacter) {
            ++place_.column;
        }
    }

    std::string_view bytes_;
    std::size_t at_ = 0;
    XmlPlace place_;
};

class Builder final : public XmlEvents {
public:
    explicit Builder(std::size_t mostBytes) : reader_(*this, nullptr), mostBytes_(mostBytes) {}

    NCFRESULT Feed(const char* bytes, std::size_t size, bool last) {
        if (size > mostBytes_ - bytes_.size()) {
            isTooLong_ = true;
            return NCF_E_NOTSUPPORTED;
        }
        bytes_.append(bytes, size);
        return reader_.Feed(bytes, size, last);
    }

    const EventReader& reader() const { return reader_; }
    bool isTooLong() const { return isTooLong_; }
    PlacedElement TakeRoot() { return std::move(root_); }

private:
    NCFRESULT OnElement(const char* name, const char** attributes) override {
        PlacedElement& element = open_.emplace_back();
        element.name = name;
        element.place = reader_.place();
        for (; *attributes != nullptr; attributes += 2) {
            element.attributes.push_back({attributes[0], attributes[1], element.place});
        }
        PlaceAttributes(element);
        return NCF_OK;
    }

    NCFRESULT OnText(std::string_view text) override {
        if (!open_.empty() && open_.back().text.empty()) {
            open_.back().text = text;
        }
        return NCF_OK;
    }

    NCFRESULT OnElementEnd() override {
        PlacedElement element = std::move(open_.back());
        open_.pop_back();
        if (open_.empty()) {
            root_ = std::move(element);
        } else {
            open_.back().elements.push_back(std::move(element));
        }
        return NCF_OK;
    }

    // The parser tells places of tags alone. It has found this one sound, so quotes pair. In an
    // encoding in which a tag is other bytes, the attributes keep the place of their element.
    void PlaceAttributes(PlacedElement& element) const {
        const std::string tag = '<' + element.name;
        const auto offset = static_cast<std::size_t>(reader_.byteOffset());
        if (offset > bytes_.size() || bytes_.compare(offset, tag.size(), tag) != 0) {
            return;
        }
        TagWalk walk(std::string_view(bytes_).substr(offset), element.place);
        walk.SkipWhile([](char c) { return !IsSpace(c) && c != '>'; });
        for (PlacedAttribute& attribute : element.attributes) {
            walk.SkipWhile(IsSpace);
            attribute.place = walk.place();
            const char quote = walk.SkipBehind("\"'");
            walk.SkipBehind(std::string_view(&quote, 1));
        }
    }

    EventReader reader_;
    std::size_t mostBytes_;
    std::string bytes_;
    bool isTooLong_ = false;
    std::vector<PlacedElement> open_;
    PlacedElement root_;
};

}  // namespace

PlacedElement ReadPlacedDocument(const std::filesystem::path& file, std::size_t mostBytes,
                                 DocumentProblem& problem) {
    Builder builder(mostBytes);
    problem = {};
    const NCFRESULT result = ReadInputFile(
        file,
        [&](const char* bytes, std::size_t size, bool last) {
            return builder.Feed(bytes, size, last);
        },
        problem.text);
    problem.isOfFile = !problem.text.empty();
    if (builder.isTooLong()) {
        problem.text = "the document has more than " + std::to_string(mostBytes) + " bytes";
        problem.isOfFile = true;
    } else if (!problem.isOfFile && result < 0) {
        problem.text = builder.reader().problemText();
        problem.place = builder.reader().problemPlace();
    }
    return problem.text.empty() ? builder.TakeRoot() : PlacedElement();
}

}  // namespace host
