#include "platform/warning_sound.h"

#include <canberra.h>

#include <QApplication>
#include <chrono>
#include <condition_variable>
#include <mutex>
#include <thread>

namespace {

constexpr std::chrono::milliseconds ShortestGap{120};

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
        ca_context* sound = openSound();
        for (;;) {
            {
                std::unique_lock lock(mutex_);
                wake_.wait(lock, [this] { return wanted_; });
                wanted_ = false;
            }
            if (!playEventSound(sound)) ringBell();
            std::this_thread::sleep_for(ShortestGap);
        }
    }

    // Other drivers than pulse print to the terminal.
    static ca_context* openSound() {
        ca_context* sound = nullptr;
        if (ca_context_create(&sound) != CA_SUCCESS) return nullptr;
        ca_context_set_driver(sound, "pulse");
        ca_context_change_props(sound, CA_PROP_APPLICATION_NAME, "Quorle",
                                CA_PROP_APPLICATION_ICON_NAME, "quorle", nullptr);
        return sound;
    }

    static bool playEventSound(ca_context* sound) {
        return sound != nullptr &&
               ca_context_play(sound, 0, CA_PROP_EVENT_ID, "dialog-warning",
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

namespace WarningSound {

void Play() {
    static auto* const player = new Player;
    player->request();
}

}  // namespace WarningSound
