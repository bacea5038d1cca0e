// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <string_view>

// Paths between the form that the module keeps, with backslashes, and the form
// that the system's calls take. The one place where either is turned; every
// part of the host that is given a path passes here.
namespace host::system {

bool IsSeparator(char32_t c);

// The path for a system call. Both kinds of slash separate, and carried bytes
// become bytes again. False when the text holds a zero or a character that no
// file name can hold.
bool ToSystemPath(std::u32string_view text, std::filesystem::path& out);

// The text of a system's path, its separators as they stand.
std::u32string FromSystemPath(const std::filesystem::path& path);

// The form that the module expects: every separator a backslash.
std::u32string ToModulePath(const std::filesystem::path& path);

// The text by which a path goes into arguments, documents and other libraries, and the path of such
// a text: the name's bytes, or UTF-8 where the system's names are characters.
std::string PathText(const std::filesystem::path& path);
std::filesystem::path PathOfText(std::string_view text);
// The same text with "/" between the names.
std::string GenericPathText(const std::filesystem::path& path);

// A text by which a library finds a file that is there, though it takes names in the C library's
// encoding alone. Where the system has none, the path's own.
std::string NameForLibraries(const std::filesystem::path& path);

// The path from the root on, otherwise as it is.
std::filesystem::path WholePath(const std::filesystem::path& path);
// An absolute path without "." and "..". Behind a link, ".." leads out of the folder that the link
// leads to; it stays where the link leads nowhere.
std::filesystem::path AbsolutePath(const std::filesystem::path& path);

// The file URL of an absolute path, and the text of the path that a URL names on this machine.
// False, with `path` unchanged, for one that names none.
std::string UrlOfPath(const std::filesystem::path& path);
bool PathTextOfUrl(std::string_view url, std::string& path);

// The path on this machine of what a URL says: the machine that it names, and the rooted path
// there. Empty: it is of another machine.
std::filesystem::path PathOfPlace(const std::string& machine, const std::string& path);

// Why no file can be called so, though the system may not say it; empty: nothing is wrong.
std::string NameProblem(const std::filesystem::path& path);
// The same of a path that is longer than the system is set up for, of which it says only that
// nothing is there.
std::string LengthProblem(const std::filesystem::path& path);

// Whether a component holds a backslash of its own, so that the module's form
// can't name it. Never on Windows.
bool HoldsBackslash(const std::filesystem::path& path);

}  // namespace host::system
