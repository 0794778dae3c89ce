#pragma once
// The desktop's warning sound.

namespace Platform {

/// Asks for the sound and returns at once. What piles up while one is being
/// started is played once.
void PlayWarningSound();

}  // namespace Platform
