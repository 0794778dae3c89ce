#pragma once
// Merging a word file into the dictionary, a step at a time, so that the game goes
// on meanwhile.

namespace Dictionary {

/// Merges a file that the player chooses. Where the word engine is not done at
/// once, the progress window takes the editor's place until it is.
void StartMerge();

/// One step; at the end the editor comes back.
void MergeStep();

/// Steps no more. For the end of the program.
void StopMerge();

}  // namespace Dictionary
