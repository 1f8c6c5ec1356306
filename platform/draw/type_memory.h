#pragma once

namespace platform {

/// The memory of the type library, in its own terms. The library ends in a fault where it is
/// refused the little that its hinting begins with: so a reserve helps out. Whoever used that gives
/// all back before the next.
void* TypeMemory();
/// Whether the machine has refused memory since this was last asked.
bool TypeMemoryWasShort();

}  // namespace platform
