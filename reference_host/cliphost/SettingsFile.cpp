// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/SettingsFile.h"

#include <fmt/format.h>

#include <algorithm>
#include <cerrno>
#include <fstream>
#include <map>
#include <sstream>
#include <vector>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/SettingsText.h"
#include "reference_host/system/Paths.h"
#include "reference_host/system/Process.h"

namespace cliphost {
namespace {

[[noreturn]] void Refuse(const std::filesystem::path& file, int line, const std::string& reason,
                         const std::string& hint) {
    throw Failure(kExitCaller, file, fmt::format("line {}: {}", line, reason), hint);
}

[[noreturn]] void FailToRead(const std::filesystem::path& file, int error) {
    throw Failure(kExitCaller, file,
                  "the settings can't be read: " + std::generic_category().message(error),
                  "--no-config goes without them");
}

// Of a file that the parser could not read.
int ReadErrorOf(const std::filesystem::path& file) {
    std::error_code error;
    const auto kind = std::filesystem::status(file, error).type();
    return kind == std::filesystem::file_type::not_found   ? ENOENT
           : error                                         ? error.default_error_condition().value()
           : kind == std::filesystem::file_type::directory ? EISDIR
                                                           : EACCES;
}

bool IsFlag(const CLI::Option& option) {
    return option.get_items_expected_max() == 0;
}

bool IsOff(const std::string& flag) {
    try {
        return CLI::detail::to_flag_value(flag) <= 0;
    } catch (const std::invalid_argument&) {
        return false;  // which the option refuses
    }
}

// Whether the command line gives an option; a flag that it takes back is none.
bool IsGiven(const CLI::Option& option) {
    const auto& values = option.results();
    return !values.empty() && !(IsFlag(option) && std::all_of(values.begin(), values.end(), IsOff));
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
            const auto file = host::system::PathOfText(app_.get_config_ptr()->as<std::string>());
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
        std::map<const CLI::Option*, std::string> seen;
        for (FileSetting& given : SettingsIn(file, content)) {
            CLI::App& verb = FindVerb(file, given);
            if (given.name.empty()) {
                continue;
            }
            Setting setting{std::move(given)};
            setting.option = &FindOption(file, verb, setting);
            const auto [first, isNew] = seen.emplace(setting.option, setting.Key());
            if (!isNew) {
                Refuse(file, setting.line,
                       fmt::format("{} and {} are one option", first->second, setting.Key()),
                       "leave one out");
            }
            if ((&verb == &app_ || verb.count() > 0) && !setting.values.empty() &&
                IsForThisCall(setting)) {
                settings.push_back(std::move(setting));
            }
        }
        const auto isOff = [&](const Setting& setting) {
            return IsFlag(*setting.option) && TimesOfFlag(file, setting) == 0;
        };
        settings.erase(std::remove_if(settings.begin(), settings.end(), isOff), settings.end());
        DropUnmet(settings);
        for (const Setting& setting : settings) {
            LetGoWhatIsOff(setting);
        }
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
                            [](const CLI::Option* other) { return IsGiven(*other); });
    }

    // An option may need one that needs another.
    static void DropUnmet(Settings& settings) {
        const auto isUnmet = [&](const Setting& setting) {
            const auto needs = setting.option->get_needs();
            return std::any_of(needs.begin(), needs.end(), [&](const CLI::Option* needed) {
                return !IsGiven(*needed) && !IsThere(settings, needed);
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
            for (int times = TimesOfFlag(file, setting); times > 0; --times) {
                setting.option->add_result("true");
            }
            return;
        }
        try {
            for (const std::string& value : setting.values) {
                setting.option->add_result(MarkedText(value));
            }
            setting.option->run_callback();
        } catch (const CLI::Error& error) {
            Refuse(file, setting.line,
                   fmt::format("{}: {}", setting.Key(), ReasonIn(error, *setting.option)), "");
        } catch (const Failure& failure) {
            Refuse(file, setting.line,
                   fmt::format("{}: {}", setting.Key(), failure.problem().reason),
                   failure.problem().hint);
        }
    }

    // The parser begins with the name of the option.
    static std::string ReasonIn(const CLI::Error& error, const CLI::Option& option) {
        const std::string text = WithoutMarks(error.what());
        const std::string start = option.get_name() + ": ";
        return text.rfind(start, 0) == 0 ? text.substr(start.size()) : text;
    }

    // As often as the option would be given; -v counts.
    static int TimesOfFlag(const std::filesystem::path& file, const Setting& setting) {
        const std::string& value = setting.values[0];
        const bool isCount = value.size() == 1 && value[0] >= '0' && value[0] <= '9';
        if (setting.values.size() != 1 || !(value == "true" || value == "false" || isCount)) {
            Refuse(file, setting.line,
                   fmt::format("{}: '{}' is neither true nor false, nor a number from 0 to 9",
                               setting.Key(), value),
                   "");
        }
        return isCount ? value[0] - '0' : value == "true" ? 1 : 0;
    }

    // The parser itself would see it as given beside what it excludes.
    static void LetGoWhatIsOff(const Setting& setting) {
        for (CLI::Option* const other : setting.option->get_excludes()) {
            if (other->count() > 0 && !IsGiven(*other)) {
                other->clear();
            }
        }
    }

    CLI::App& app_;
};

}  // namespace

std::filesystem::path DefaultSettingsFile() {
    constexpr char kName[] = "cliphost.toml";
    const std::filesystem::path folder = host::system::SettingsFolder();
    return folder.empty() ? folder : folder / kName;
}

void AddSettingsFile(CLI::App& app) {
    const CLI::Validator toOpen(
        [](std::string& text) {
            text = host::system::NameForLibraries(host::system::PathOfText(text));
            return std::string();
        },
        "", "NameForLibraries");
    app.set_config(
           "--config", host::system::PathText(DefaultSettingsFile()),
           fmt::format("Read options from this file instead of {}cliphost.toml; those of the "
                       "command line win over it",
                       host::system::kSettingsFolderInWords))
        ->transform(toOpen);
    app.add_flag(kNoSettingsFile, "Read no such file")->configurable(false);
    app.config_formatter(std::make_shared<SettingsReader>(app));
}

void RefuseUnreadSettings(CLI::App& app) {
    // The parser notes there what it has read.
    if (app.get_config_ptr()->count() > 0 || app.get_option(kNoSettingsFile)->count() > 0) {
        return;
    }
    const std::filesystem::path file = DefaultSettingsFile();
    if (const int reason = ReadErrorOf(file); !file.empty() && reason != ENOENT) {
        FailToRead(file, reason);
    }
}

void RefuseGivenSettings(const CLI::App& app) {
    const auto& given = app.get_config_ptr()->results();
    const std::filesystem::path file =
        host::system::PathOfText(WithoutMarks(given.empty() ? std::string() : given[0]));
    FailToRead(file, ReadErrorOf(file));
}

}  // namespace cliphost
