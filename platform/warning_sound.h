#pragma once
// The desktop's warning sound.

namespace WarningSound {

/// Asks for the sound and returns at once. What piles up while one is being
/// started is played once.
void Play();

}  // namespace WarningSound
