#pragma once
// The desktop's or the system's wish that the program end.
#include <functional>

/// Runs `close` when the session ends and the player can be asked, and on SIGTERM,
/// SIGINT and SIGHUP. A signal while a box is open ends the program at once: what
/// the box asks about stays as it was.
void FollowSessionEnd(std::function<void()> close);
