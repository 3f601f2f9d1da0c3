#include "program/interruption.h"

#include <array>
#include <atomic>
#include <csignal>

namespace deskplayer
{

namespace
{

constexpr std::array<int, 3> EndingSignals{SIGHUP, SIGINT, SIGTERM};

/** 0 if there was none. */
std::atomic<int> g_Requested{0};

extern "C" void NoteSignal(int signal)
{
    g_Requested = signal;
}

/** Replaces a handler, but not that of a signal that is ignored. */
void Handle(int signal, void (*handler)(int))
{
    struct sigaction old = {};
    sigaction(signal, nullptr, &old);
    if (old.sa_handler != SIG_IGN) {
        struct sigaction replacing = {};
        replacing.sa_handler = handler;
        replacing.sa_flags = static_cast<int>(SA_RESETHAND);
        sigaction(signal, &replacing, nullptr);
    }
}

} // namespace

Interruption::Interruption()
{
    for (const int signal : EndingSignals) {
        Handle(signal, NoteSignal);
    }
}

Interruption::~Interruption()
{
    for (const int signal : EndingSignals) {
        Handle(signal, SIG_DFL);
    }
}

bool Interruption::IsRequested() const
{
    return g_Requested != 0;
}

void Interruption::EndIfRequested() const
{
    if (IsRequested()) {
        Handle(g_Requested, SIG_DFL);
        std::raise(g_Requested);
    }
}

} // namespace deskplayer
