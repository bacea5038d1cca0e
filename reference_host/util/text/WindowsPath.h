// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

// Paths of Windows, as texts in UTF-8, on any system.
namespace host::text {

// Why no file can have this path, though the system might take it for another one or for a
// device; empty: nothing is wrong with it.
std::string WindowsPathProblem(std::string_view path);

// The path without the start that lets any name pass, \\?\ or \\?\UNC\. Programs write down paths
// that others are to understand.
std::string WithoutVerbatimStart(std::string_view path);

// The URL of an absolute path (RFC 8089): a drive stands behind an empty machine, and the server of
// a share is the machine.
std::string UrlOfWindowsPath(std::string_view path);

// The path that a URL names, with backslashes, or that its machine and the path there name. False,
// with `path` unchanged, for one without a drive or a machine.
bool WindowsPathOfUrl(std::string_view url, std::string& path);
bool WindowsPathOfPlace(const std::string& machine, std::string rooted, std::string& path);

}  // namespace host::text
