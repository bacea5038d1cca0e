// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/DelayedSignals.h"

namespace host::system {
namespace {

volatile std::sig_atomic_t noted = 0;

extern "C" void NoteSignal(int signal) {
    noted = signal;
}

}  // namespace

DelayedSignals::DelayedSignals() {
    noted = 0;
    for (const int signal : {SIGINT, SIGTERM, SIGHUP, SIGQUIT, SIGPIPE}) {
        Before before{signal, {}};
        if (sigaction(signal, nullptr, &before.action) != 0 ||
            before.action.sa_handler == SIG_IGN) {
            continue;
        }
        struct sigaction action {};
        action.sa_handler = NoteSignal;  // waits are cut short: no SA_RESTART
        if (sigaction(signal, &action, nullptr) == 0) {
            before_.push_back(before);
        }
    }
}

DelayedSignals::~DelayedSignals() {
    for (const Before& before : before_) {
        sigaction(before.signal, &before.action, nullptr);
    }
    if (noted != 0) {
        std::raise(noted);
    }
}

bool DelayedSignals::HaveCome() {
    return noted != 0;
}

}  // namespace host::system
