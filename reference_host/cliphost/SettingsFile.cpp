// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/SettingsFile.h"

#include <fmt/format.h>

#include <algorithm>
#include <cctype>
#include <cerrno>
#include <cstdlib>
#include <fstream>
#include <sstream>
#include <vector>

#include "reference_host/cliphost/Failure.h"

namespace cliphost {
namespace {

constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
constexpr char kHint[] = "write it such as `jobs = 4` or `[describe]`";

[[noreturn]] void Refuse(const std::filesystem::path& file, int line, const std::string& reason,
                         const std::string& hint) {
    throw Failure(kExitCaller, file, fmt::format("line {}: {}", line, reason), hint);
}

bool IsOfName(char c) {
    return std::isalnum(static_cast<unsigned char>(c)) != 0 || c == '-' || c == '_';
}

// A text from its start to its end, with the number of the line.
class SettingsText {
public:
    SettingsText(const std::filesystem::path& file, std::string_view text)
        : file_(file), text_(text) {
        if (text_.substr(0, kByteOrderMark.size()) == kByteOrderMark) {
            at_ = kByteOrderMark.size();
        }
    }

    std::vector<FileSetting> Read() {
        while (SkipToNext(true)) {
            if (text_[at_] == '[') {
                settings_.push_back({section_ = SectionName(), {}, {}, line_});
            } else {
                AddSetting();
            }
            if (SkipToNext(false) && text_[at_] != '\n') {
                Fail("more stands behind it");
            }
        }
        return std::move(settings_);
    }

private:
    [[noreturn]] void Fail(const std::string& reason) const { Refuse(file_, line_, reason, kHint); }
    bool IsAt(char c) const { return at_ < text_.size() && text_[at_] == c; }

    // Over spaces and comments; and line ends, where they mean nothing. False at the end.
    bool SkipToNext(bool overLines) {
        for (; at_ < text_.size(); ++at_) {
            const char c = text_[at_];
            if (c == '#') {
                at_ = std::min(text_.find('\n', at_), text_.size()) - 1;
            } else if (c == '\n' && overLines) {
                ++line_;
            } else if (c != ' ' && c != '\t' && c != '\r') {
                return true;
            }
        }
        return false;
    }

    std::string Name() {
        const std::size_t start = at_;
        while (at_ < text_.size() && IsOfName(text_[at_])) {
            ++at_;
        }
        return std::string(text_.substr(start, at_ - start));
    }

    std::string SectionName() {
        ++at_;
        SkipToNext(false);
        std::string name = Name();
        SkipToNext(false);
        if (name.empty() || !IsAt(']')) {
            Fail("is no section");
        }
        ++at_;
        return name;
    }

    void AddSetting() {
        FileSetting setting{section_, Name(), {}, line_};
        SkipToNext(false);
        if (setting.name.empty() || !IsAt('=')) {
            Fail("is no setting");
        }
        ++at_;
        SkipToNext(false);
        for (const FileSetting& known : settings_) {
            if (known.section == setting.section && known.name == setting.name) {
                Refuse(file_, line_,
                       fmt::format("{} is given in line {} already", setting.name, known.line),
                       "a list has several values: [\"A\", \"B\"]");
            }
        }
        if (IsAt('[')) {
            AddValues(setting);
        } else {
            setting.values.push_back(Value());
        }
        settings_.push_back(std::move(setting));
    }

    void AddValues(FileSetting& setting) {
        ++at_;
        while (SkipToNext(true) && !IsAt(']')) {
            setting.values.push_back(Value());
            if (SkipToNext(true) && IsAt(',')) {
                ++at_;
            } else {
                break;
            }
        }
        if (!IsAt(']')) {
            Refuse(file_, setting.line, "the list is not closed", kHint);
        }
        ++at_;
    }

    std::string Value() {
        if (IsAt('\'') || IsAt('"')) {
            return QuotedValue(text_[at_++]);
        }
        const std::size_t start = at_;
        at_ = std::min(text_.find_first_of(" \t\r\n#,[]\"'", at_), text_.size());
        if (at_ == start) {
            Fail("is no setting");
        }
        return std::string(text_.substr(start, at_ - start));
    }

    // Between quotes of the one kind all stands for itself, between those of the other a backslash
    // makes the next character do so.
    std::string QuotedValue(char quote) {
        std::string value;
        for (; at_ < text_.size() && text_[at_] != '\n'; ++at_) {
            char c = text_[at_];
            if (c == quote) {
                ++at_;
                return value;
            }
            if (c == '\\' && quote == '"') {
                ++at_;
                if (!IsAt('\\') && !IsAt('"')) {
                    Fail(
                        "behind a backslash stands neither a backslash nor a quote; between '' "
                        "backslashes are as they stand");
                }
                c = text_[at_];
            }
            if (c == '\0') {
                break;
            }
            value += c;
        }
        Fail("a quote is not closed");
    }

    const std::filesystem::path& file_;
    std::string_view text_;
    std::size_t at_ = 0;
    int line_ = 1;
    std::string section_;
    std::vector<FileSetting> settings_;
};

[[noreturn]] void FailToRead(const std::filesystem::path& file, int error) {
    throw Failure(kExitCaller, file,
                  "the settings can't be read: " + std::generic_category().message(error),
                  "--no-config goes without them");
}

bool IsFlag(const CLI::Option& option) {
    return option.get_items_expected_max() == 0;
}

// A setting with the option that it is for.
struct Setting : FileSetting {
    CLI::Option* option = nullptr;

    std::string Key() const { return section.empty() ? name : section + '.' + name; }
};

using Settings = std::vector<Setting>;

bool IsThere(const Settings& settings, const CLI::Option* option) {
    return std::any_of(settings.begin(), settings.end(),
                       [&](const Setting& setting) { return setting.option == option; });
}

class SettingsReader : public CLI::ConfigBase {
public:
    explicit SettingsReader(CLI::App& app) : app_(app) {}

    // All is done here; the parser itself is left nothing to do.
    std::vector<CLI::ConfigItem> from_config(std::istream& stream) const override {
        if (app_.get_option(kNoSettingsFile)->count() == 0 && !IsHelpAsked()) {
            const auto file = app_.get_config_ptr()->as<std::string>();
            Read(file, TextOf(file, stream));
        }
        return {};
    }

private:
    bool IsHelpAsked() const {
        std::vector<CLI::App*> apps = app_.get_subcommands();
        apps.push_back(&app_);
        return app_.get_option("--version")->count() > 0 ||
               std::any_of(apps.begin(), apps.end(), [](const CLI::App* app) {
                   return app->get_help_ptr() && app->get_help_ptr()->count() > 0;
               });
    }

    void Read(const std::filesystem::path& file, const std::string& content) const {
        Settings settings;
        for (FileSetting& given : SettingsIn(file, content)) {
            CLI::App& verb = FindVerb(file, given);
            if (given.name.empty()) {
                continue;
            }
            Setting setting{std::move(given)};
            setting.option = &FindOption(file, verb, setting);
            if ((&verb == &app_ || verb.count() > 0) && !setting.values.empty() &&
                IsForThisCall(setting)) {
                settings.push_back(std::move(setting));
            }
        }
        DropUnmet(settings);
        for (const Setting& setting : settings) {
            Apply(file, setting, settings);
        }
    }

    static std::string TextOf(const std::filesystem::path& file, std::istream& stream) {
        std::ostringstream text;
        errno = 0;
        if (stream.peek() != std::istream::traits_type::eof()) {
            text << stream.rdbuf();
        }
        if (errno != 0) {
            FailToRead(file, errno);
        }
        return text.str();
    }

    CLI::App& FindVerb(const std::filesystem::path& file, const FileSetting& setting) const {
        if (setting.section.empty()) {
            return app_;
        }
        const auto verbs = app_.get_subcommands([&](const CLI::App* verb) {
            return verb->get_name() == setting.section && !verb->get_group().empty();
        });
        if (verbs.empty()) {
            Refuse(file, setting.line, fmt::format("[{}] names no verb", setting.section),
                   "`cliphost --help` lists them");
        }
        return *verbs[0];
    }

    CLI::Option& FindOption(const std::filesystem::path& file, CLI::App& verb,
                            const Setting& setting) const {
        const auto find = [&](CLI::App& app) {
            const char* const dashes = setting.name.size() == 1 ? "-" : "--";
            CLI::Option* const found = app.get_option_no_throw(dashes + setting.name);
            return found && found->get_configurable() ? found : nullptr;
        };
        CLI::Option* const option = find(verb);
        if (!option) {
            Refuse(file, setting.line, setting.Key() + ": there is no such option",
                   &verb == &app_ ? "`cliphost --help` lists those that stand before the sections"
                   : find(app_)   ? "it stands before the first section"
                                : fmt::format("`cliphost {} --help` lists them", setting.section));
        }
        return *option;
    }

    // What the command line says stays, and so does what excludes it there.
    static bool IsForThisCall(const Setting& setting) {
        const auto excluding = setting.option->get_excludes();
        return setting.option->count() == 0 &&
               std::none_of(excluding.begin(), excluding.end(),
                            [](const CLI::Option* other) { return other->count() > 0; });
    }

    // An option may need one that needs another.
    static void DropUnmet(Settings& settings) {
        const auto isUnmet = [&](const Setting& setting) {
            const auto needs = setting.option->get_needs();
            return std::any_of(needs.begin(), needs.end(), [&](const CLI::Option* needed) {
                return needed->count() == 0 && !IsThere(settings, needed);
            });
        };
        for (auto unmet = settings.begin(); unmet != settings.end();) {
            unmet = std::find_if(settings.begin(), settings.end(), isUnmet);
            if (unmet != settings.end()) {
                settings.erase(unmet);
                unmet = settings.begin();
            }
        }
    }

    static void Apply(const std::filesystem::path& file, const Setting& setting,
                      const Settings& all) {
        for (const CLI::Option* const other : setting.option->get_excludes()) {
            if (IsThere(all, other)) {
                Refuse(file, setting.line,
                       fmt::format("{} and {} exclude each other", setting.Key(),
                                   other->get_name().substr(2)),
                       "leave one out");
            }
        }
        if (IsFlag(*setting.option)) {
            ApplyFlag(file, setting);
            return;
        }
        try {
            setting.option->add_result(setting.values);
            setting.option->run_callback();
        } catch (const CLI::Error& error) {
            Refuse(file, setting.line, fmt::format("{}: {}", setting.Key(), error.what()), "");
        } catch (const Failure& failure) {
            Refuse(file, setting.line,
                   fmt::format("{}: {}", setting.Key(), failure.problem().reason),
                   failure.problem().hint);
        }
    }

    // As often as the option would be given; -v counts.
    static void ApplyFlag(const std::filesystem::path& file, const Setting& setting) {
        const std::string& value = setting.values[0];
        const bool isCount = value.size() == 1 && value[0] >= '0' && value[0] <= '9';
        if (setting.values.size() != 1 || !(value == "true" || value == "false" || isCount)) {
            Refuse(file, setting.line,
                   fmt::format("{}: '{}' is neither true nor false", setting.Key(), value), "");
        }
        for (int times = isCount ? value[0] - '0' : value == "true" ? 1 : 0; times > 0; --times) {
            setting.option->add_result("true");
        }
    }

    CLI::App& app_;
};

}  // namespace

std::vector<FileSetting> SettingsIn(const std::filesystem::path& file, std::string_view text) {
    return SettingsText(file, text).Read();
}

std::filesystem::path DefaultSettingsFile() {
    constexpr char kName[] = "cliphost.toml";
    const auto folder = [](const char* variable) {
        const char* const value = std::getenv(variable);
        const std::filesystem::path path = value ? value : "";
        return path.is_absolute() ? path : std::filesystem::path();
    };
    if (const auto own = folder("XDG_CONFIG_HOME"); !own.empty()) {
        return own / kName;
    }
    const auto home = folder("HOME");
    return home.empty() ? home : home / ".config" / kName;
}

void AddSettingsFile(CLI::App& app) {
    app.set_config(
        "--config", DefaultSettingsFile().string(),
        "Read options from this file instead of ~/.config/cliphost.toml; those of the command line "
        "win over it");
    app.add_flag(kNoSettingsFile, "Read no such file")->configurable(false);
    app.config_formatter(std::make_shared<SettingsReader>(app));
}

void RefuseUnreadSettings(CLI::App& app) {
    // The parser notes there what it has read.
    if (app.get_config_ptr()->count() > 0 || app.get_option(kNoSettingsFile)->count() > 0) {
        return;
    }
    const std::filesystem::path file = DefaultSettingsFile();
    std::error_code error;
    const auto kind = std::filesystem::status(file, error).type();
    if (file.empty() || kind == std::filesystem::file_type::not_found) {
        return;
    }
    const int reason = error                                           ? error.value()
                       : kind == std::filesystem::file_type::directory ? EISDIR
                                                                       : EACCES;
    FailToRead(file, reason);
}

}  // namespace cliphost
