#include "screens/terminal/RestoreGuard.h"

#include <algorithm>
#include <cstdlib>
#include <unistd.h>

namespace orvane
{

namespace
{

constexpr int kSignals[] = {SIGSEGV, SIGBUS,    SIGFPE,  SIGILL,  SIGABRT, SIGSYS,
                            SIGTRAP, SIGQUIT,   SIGXCPU, SIGXFSZ, SIGALRM, SIGUSR1,
                            SIGUSR2, SIGVTALRM, SIGPROF, SIGINT,  SIGTERM, SIGHUP};
constexpr std::size_t kHandlerStackSize = 64 * 1024;

RestoreGuard* current = nullptr;

} // namespace

RestoreGuard::RestoreGuard(int terminal) : _terminal(terminal), _handlerStack(kHandlerStackSize)
{
    rememberModes();
    current = this;
    [[maybe_unused]] static const int registered = std::atexit(handleExit);

    stack_t stack{};
    if (::sigaltstack(nullptr, &stack) == 0 && (stack.ss_flags & SS_DISABLE)) {
        stack = {_handlerStack.data(), 0, _handlerStack.size()};
        ::sigaltstack(&stack, nullptr);
    } else {
        _handlerStack.clear(); // there is one already, for example of a sanitizer
    }
    for (const int signal : kSignals) {
        Earlier earlier{signal, {}};
        ::sigaction(signal, nullptr, &earlier.action);
        const bool isCrash = std::find(kSignals, kSignals + 7, signal) != kSignals + 7;
        if (!isCrash && earlier.action.sa_handler != SIG_DFL)
            continue;
        struct sigaction action {
        };
        action.sa_handler = handleSignal;
        action.sa_flags = SA_ONSTACK;
        ::sigfillset(&action.sa_mask);
        if (::sigaction(signal, &action, nullptr) == 0)
            _earlier.push_back(earlier);
    }
}

RestoreGuard::~RestoreGuard()
{
    disarm();
    for (const Earlier& earlier : _earlier)
        ::sigaction(earlier.signal, &earlier.action, nullptr);
    if (!_handlerStack.empty()) {
        stack_t none{};
        none.ss_flags = SS_DISABLE;
        ::sigaltstack(&none, nullptr);
    }
    current = nullptr;
}

void RestoreGuard::arm(std::string_view restoring)
{
    _restoringSize = std::min(restoring.size(), _restoring.size());
    std::copy_n(restoring.begin(), _restoringSize, _restoring.begin());
    _isArmed = 1;
    _heldErrors.hold(_terminal);
}

void RestoreGuard::disarm()
{
    _isArmed = 0;
    _heldErrors.release();
}

void RestoreGuard::rememberModes() { ::tcgetattr(_terminal, &_modes); }

// Uses only functions that are safe in a signal handler.
void RestoreGuard::restore()
{
    if (!_isArmed)
        return;
    _isArmed = 0;
    [[maybe_unused]] const auto written = ::write(_terminal, _restoring.data(), _restoringSize);
    ::tcsetattr(_terminal, TCSANOW, &_modes);
    _heldErrors.release();
}

void RestoreGuard::handleSignal(int signal)
{
    if (!current)
        return;
    current->restore();
    // The earlier action follows: as a rule the process ends.
    for (const Earlier& earlier : current->_earlier)
        if (earlier.signal == signal)
            ::sigaction(signal, &earlier.action, nullptr);
    ::raise(signal);
}

void RestoreGuard::handleExit()
{
    if (current)
        current->restore();
}

} // namespace orvane
