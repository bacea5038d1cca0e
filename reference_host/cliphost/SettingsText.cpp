// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/SettingsText.h"

#include <fmt/format.h>

#include <algorithm>
#include <string>

#define TOML_HEADER_ONLY 1  // so that no library is loaded at each start
#include <toml++/toml.h>

#include "reference_host/cliphost/Failure.h"

namespace cliphost {
namespace {

[[noreturn]] void Refuse(const std::filesystem::path& file, toml::source_index line,
                         const std::string& reason) {
    throw Failure(kExitCaller, file, fmt::format("line {}: {}", line, reason),
                  "write it such as `jobs = 4`, `extensions = \"mov,mp4\"` or `[describe]`");
}

int LineOf(const toml::node& node) {
    return static_cast<int>(node.source().begin.line);
}

class SettingsText {
public:
    explicit SettingsText(const std::filesystem::path& file) : file_(file) {}

    std::vector<FileSetting> Read(std::string_view text) {
        try {
            const toml::table all = toml::parse(text);
            Add({}, all);
        } catch (const toml::parse_error& error) {
            Refuse(file_, error.source().begin.line, std::string(error.description()));
        }
        std::stable_sort(
            settings_.begin(), settings_.end(),
            [](const FileSetting& a, const FileSetting& b) { return a.line < b.line; });
        return std::move(settings_);
    }

private:
    void Add(const std::string& section, const toml::table& table) {
        for (const auto& [key, node] : table) {
            const std::string name(key.str());
            const toml::table* const inner = node.as_table();
            if (inner && !section.empty()) {
                Refuse(file_, LineOf(node),
                       fmt::format("[{}.{}]: a section has no other within it", section, name));
            }
            if (inner) {
                settings_.push_back({name, {}, {}, LineOf(node)});
                Add(name, *inner);
            } else {
                settings_.push_back({section, name, ValuesOf(name, node), LineOf(node)});
            }
        }
    }

    std::vector<std::string> ValuesOf(const std::string& name, const toml::node& node) const {
        std::vector<std::string> values;
        if (const toml::array* const list = node.as_array()) {
            for (const toml::node& value : *list) {
                values.push_back(ValueOf(name, value));
            }
        } else {
            values.push_back(ValueOf(name, node));
        }
        return values;
    }

    std::string ValueOf(const std::string& name, const toml::node& node) const {
        if (const auto* const text = node.as_string()) {
            if (text->get().find('\0') == std::string::npos) {
                return text->get();
            }
        } else if (const auto* const whole = node.as_integer()) {
            return std::to_string(whole->get());
        } else if (const auto* const number = node.as_floating_point()) {
            return fmt::format("{}", number->get());
        } else if (const auto* const flag = node.as_boolean()) {
            return flag->get() ? "true" : "false";
        }
        Refuse(file_, LineOf(node),
               name + ": is neither a text, a number, true, false, nor a list of such");
    }

    const std::filesystem::path& file_;
    std::vector<FileSetting> settings_;
};

}  // namespace

std::vector<FileSetting> SettingsIn(const std::filesystem::path& file, std::string_view text) {
    return SettingsText(file).Read(text);
}

}  // namespace cliphost
