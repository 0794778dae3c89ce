#pragma once
// Memory at the start, which is most of what a start costs.

namespace Platform {

/// Has the system hand over at once what the start takes of the heap: page by page, as each is
/// first written, it would cost a trap for every one. Call it before anything else.
void PrepareHeap();

/// Gives back what the start has left free.
void TrimHeap();

}  // namespace Platform
