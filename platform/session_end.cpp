#include "platform/session_end.h"

#include <fcntl.h>
#include <unistd.h>

#include <QApplication>
#include <QSessionManager>
#include <QSocketNotifier>
#include <array>
#include <csignal>
#include <utility>

namespace {

std::array<int, 2> PipeEnds{-1, -1};

// A handler may do little more than write; the event loop does the rest.
void NoteSignal(int signal) {
    const auto number = static_cast<char>(signal);
    [[maybe_unused]] const auto written = write(PipeEnds[1], &number, 1);
}

// Asked a second time below an open box, the player could answer the two differently.
void Close(const std::function<void()>& close, int signal) {
    if (QApplication::activeModalWidget() == nullptr) return close();
    std::signal(signal, SIG_DFL);
    std::raise(signal);
}

void FollowSignals(const std::function<void()>& close) {
    if (pipe2(PipeEnds.data(), O_CLOEXEC | O_NONBLOCK) != 0) return;
    auto* notifier = new QSocketNotifier(PipeEnds[0], QSocketNotifier::Read, qApp);
    QObject::connect(notifier, &QSocketNotifier::activated, qApp, [close] {
        char signal = 0;
        if (read(PipeEnds[0], &signal, 1) == 1) Close(close, signal);
    });
    for (const int signal : {SIGTERM, SIGINT, SIGHUP}) std::signal(signal, NoteSignal);
}

}  // namespace

void Platform::FollowSessionEnd(std::function<void()> close) {
    FollowSignals(close);
    QObject::connect(qApp, &QGuiApplication::commitDataRequest, qApp,
                     [close = std::move(close)](QSessionManager& session) {
                         if (!session.allowsInteraction()) return;
                         Close(close, SIGTERM);
                         session.release();
                     });
}
