#pragma once

namespace ax {

// Whether the caller runs on the main thread: the one that loaded this library. Any thread may ask.
bool isMainThread();

}  // namespace ax
