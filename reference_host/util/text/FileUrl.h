// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

// The percent form in which a URL carries any byte (RFC 3986).
namespace host::text {

// All but unreserved characters and "/" escaped.
std::string PercentEncoded(std::string_view bytes);

// False, with `bytes` unchanged, for a "%" without two hexadecimal digits.
bool PercentDecoded(std::string_view text, std::string& bytes);

// The URL of an absolute path of this machine (RFC 8089), for any bytes.
std::string FileUrl(std::string_view path);

// Whether a text is meant as a file URL.
bool IsFileUrl(std::string_view text);

// The parts of a file URL, decoded: the machine, empty for this one, and the rooted path. False,
// with both unchanged, for one without a rooted path, for one with a byte of zero, and for one with
// a slash in the machine's name.
bool SplitFileUrl(std::string_view url, std::string& machine, std::string& path);

// The path that a file URL names on this machine. False, with `path` unchanged,
// for one that names another machine, no rooted path, or a byte of zero.
bool PathOfFileUrl(std::string_view url, std::string& path);

}  // namespace host::text
