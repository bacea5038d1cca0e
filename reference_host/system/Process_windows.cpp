// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Process.h"

#include <fcntl.h>
#include <io.h>

#include <cstdio>
#include <cstdlib>

#include "reference_host/system/WindowsCalls.h"
#include "text/Encodings.h"

// It needs what stands above.
#include <shellapi.h>

namespace host::system {
namespace {

bool IsConsole(DWORD stream) {
    DWORD mode = 0;
    return GetConsoleMode(GetStdHandle(stream), &mode) != 0;
}

}  // namespace

void PrepareProcess() {
    EndByEvents();
    // Nobody may sit there to close a window.
    SetErrorMode(SEM_FAILCRITICALERRORS | SEM_NOGPFAULTERRORBOX | SEM_NOOPENFILEERRORBOX);
    for (const int stream : {0, 1, 2}) {
        _setmode(stream, _O_BINARY);
    }
    // Where it is no console, the C library would keep back what is said until there is more of it.
    std::setvbuf(stderr, nullptr, _IONBF, 0);
    if (IsConsole(STD_OUTPUT_HANDLE) || IsConsole(STD_ERROR_HANDLE)) {
        PrintUtf8();
    }
}

std::vector<std::string> CommandLineWords(int argc, char** argv) {
    int count = 0;
    LPWSTR* const parted = CommandLineToArgvW(GetCommandLineW(), &count);
    if (parted == nullptr) {
        return {argv, argv + argc};
    }
    std::vector<std::string> words;
    for (int i = 0; i < count; ++i) {
        words.push_back(encodings::ToUtf8Lossy(encodings::FromWide(parted[i])));
    }
    LocalFree(parted);
    return words;
}

const char* const kSettingsFolderInWords = "%APPDATA%\\";

std::filesystem::path SettingsFolder() {
    const wchar_t* const folder = _wgetenv(L"APPDATA");
    return folder == nullptr ? L"" : folder;
}

std::filesystem::path ProgramFile(const char*) {
    return TextOf(
        [](wchar_t* text, DWORD size) { return GetModuleFileNameW(nullptr, text, size); });
}

bool IsWatched() {
    return IsConsole(STD_ERROR_HANDLE);
}

}  // namespace host::system
