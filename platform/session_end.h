#pragma once
// The desktop's or the system's wish that the program end.
#include <functional>

namespace Platform {

/// Runs `close` when the session ends and the player can be asked, and on SIGTERM,
/// SIGINT and SIGHUP. While a box is open each of these ends the program at once
/// instead: what the box asks about stays as it was.
void FollowSessionEnd(std::function<void()> close);

}  // namespace Platform
