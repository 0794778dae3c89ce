#include "platform/desktop.h"

#include <canberra.h>

#include <QApplication>
#include <QLibrary>
#include <chrono>
#include <condition_variable>
#include <mutex>
#include <thread>

namespace {

constexpr std::chrono::milliseconds ShortestGap{120};

/// The sound library. Loading it with the program would take a fortieth of the start, so it comes
/// with the first sound; all null where it cannot.
struct Canberra {
    Canberra() {
        QLibrary library("canberra", 0);
        if (!library.load()) return;
        find(library, "ca_context_create", create);
        find(library, "ca_context_set_driver", setDriver);
        find(library, "ca_context_change_props", changeProperties);
        find(library, "ca_context_play", play);
    }

    decltype(&ca_context_create) create = nullptr;
    decltype(&ca_context_set_driver) setDriver = nullptr;
    decltype(&ca_context_change_props) changeProperties = nullptr;
    decltype(&ca_context_play) play = nullptr;

  private:
    template <class Function>
    static void find(QLibrary& library, const char* name, Function*& function) {
        function = reinterpret_cast<Function*>(library.resolve(name));
    }
};

// A sound server may hang, so a thread of its own waits for it, also while the
// program ends; what that thread uses is therefore never destroyed.
class Player {
  public:
    Player() {
        std::thread([this] { work(); }).detach();
    }

    void request() {
        {
            const std::lock_guard lock(mutex_);
            wanted_ = true;
        }
        wake_.notify_one();
    }

  private:
    [[noreturn]] void work() {
        const Canberra canberra;
        ca_context* sound = openSound(canberra);
        for (;;) {
            {
                std::unique_lock lock(mutex_);
                wake_.wait(lock, [this] { return wanted_; });
                wanted_ = false;
            }
            if (!playEventSound(canberra, sound)) ringBell();
            std::this_thread::sleep_for(ShortestGap);
        }
    }

    // Other drivers than pulse print to the terminal.
    static ca_context* openSound(const Canberra& canberra) {
        ca_context* sound = nullptr;
        if (canberra.create == nullptr || canberra.create(&sound) != CA_SUCCESS) return nullptr;
        canberra.setDriver(sound, "pulse");
        canberra.changeProperties(sound, CA_PROP_APPLICATION_NAME, "Quorle",
                                  CA_PROP_APPLICATION_ICON_NAME, "quorle", nullptr);
        return sound;
    }

    static bool playEventSound(const Canberra& canberra, ca_context* sound) {
        return sound != nullptr &&
               canberra.play(sound, 0, CA_PROP_EVENT_ID, "dialog-warning",
                             CA_PROP_EVENT_DESCRIPTION, "Warning", nullptr) == CA_SUCCESS;
    }

    // The desktop's bell belongs to the user-interface thread.
    static void ringBell() {
        if (auto* application = QCoreApplication::instance()) {
            QMetaObject::invokeMethod(application, [] { QApplication::beep(); });
        }
    }

    std::mutex mutex_;
    std::condition_variable wake_;
    bool wanted_ = false;
};

}  // namespace

void Platform::PlayWarningSound() {
    static auto* const player = new Player;
    player->request();
}
