// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/DelayedSignals.h"

#include <atomic>
#include <csignal>
#include <cstring>

#include "reference_host/system/UnfinishedFile.h"
#include "reference_host/system/WindowsCalls.h"

namespace host::system {
namespace {

constexpr ULONGLONG kMillisecondsToSecond = 1000;

std::atomic<int> noted = 0;
std::atomic<ULONGLONG> notedAt = 0;
std::atomic<const char*> lineToWrite = nullptr;
int objects = 0;

// The system calls it in a thread of its own.
BOOL WINAPI NoteEvent(DWORD event) {
    const bool isFromKeyboard = event == CTRL_C_EVENT || event == CTRL_BREAK_EVENT;
    const int signal = isFromKeyboard ? SIGINT : SIGTERM;
    const char* const line = lineToWrite;
    if (line != nullptr && noted != 0 && GetTickCount64() >= notedAt + kMillisecondsToSecond) {
        EndBySignal(signal);
    }
    if (noted == 0) {
        notedAt = GetTickCount64();
        noted = signal;
        SetEvent(SignalEvent());
        DWORD ignored = 0;
        if (line != nullptr) {
            WriteFile(GetStdHandle(STD_ERROR_HANDLE), line, static_cast<DWORD>(std::strlen(line)),
                      &ignored, nullptr);
        }
    }
    if (!isFromKeyboard) {
        // Once it returns the system ends the program; until then there are some seconds.
        Sleep(INFINITE);
    }
    return TRUE;
}

}  // namespace

struct DelayedSignals::Before {};

DelayedSignals::DelayedSignals(const char* line) {
    if (objects++ > 0) {
        return;
    }
    noted = 0;
    lineToWrite = line;
    ResetEvent(SignalEvent());
    SetConsoleCtrlHandler(NoteEvent, TRUE);
}

DelayedSignals::~DelayedSignals() {
    if (--objects > 0) {
        return;
    }
    if (noted != 0) {
        EndBySignal(noted);  // a handler that still waits would keep the system's list of them
    }
    SetConsoleCtrlHandler(NoteEvent, FALSE);
    ResetEvent(SignalEvent());
}

int DelayedSignals::Which() {
    return noted;
}

bool DelayedSignals::ReaderHasGone() {
    return false;  // only a write tells
}

}  // namespace host::system
