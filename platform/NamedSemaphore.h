// Named semaphores of the host, machine-wide: what Access stands on.
//
// A semaphore comes to be with its first handle and is gone with its last one, however that one ends: closed, its
// process killed, or another program executed in its place. While a handle is open, the count stays where it was left,
// by a dead process too. A unit has no owner: any handle may release what another took.
//
// Names are text of 1 to 259 bytes, compared byte by byte. All calls may be made by several threads at once; one
// handle may be used by several threads, but closed by one. Taking and releasing never block. Opening and closing
// block for a bounded time at most, and only while another process stands still in the middle of the same.
//
// A handle that a child inherited through fork is inert there: taking and releasing fail, closing frees its memory
// only, and the parent's semaphore neither notices the child nor lives longer by it.
#pragma once

#include <cstdint>

/// A semaphore's handle is a pointer to this; what it points to is the host body's secret.
struct PlatformSemaphore;

namespace NamedSemaphore {

/// What take() gives. Other values are failures of the host.
enum TakeResult : std::uint32_t { taken = 0, abandoned = 0x80, timedOut = 0x102, failed = 0xFFFFFFFF };

/// Failure codes that both hosts give for the same mistake.
enum Failure : int { notFound = 2, invalidHandle = 6, invalidParameter = 87, tooManyUnits = 298 };

/// Gives a handle on the living semaphore of this name, or null where there is none.
PlatformSemaphore* open(const char* name);

/// Gives a handle on the living semaphore of this name, with its count and maximum; where there is none, makes it, with
/// 0 <= initial <= maximum and maximum > 0. @p wasThere, unless null, tells which. Null on failure; explainLastError()
/// says why.
PlatformSemaphore* create(const char* name, std::int32_t initial, std::int32_t maximum, bool* wasThere = nullptr);

/// Gives a second handle on the semaphore of @p handle, to be closed by itself; null on failure.
PlatformSemaphore* duplicate(PlatformSemaphore* handle);

/// Takes one unit if the count is above 0: a TakeResult.
std::uint32_t take(PlatformSemaphore* handle);

/// Adds @p units > 0 to the count and puts the former count into @p previous unless that is null. Where the sum would
/// pass the maximum, changes nothing and gives false.
bool release(PlatformSemaphore* handle, std::int32_t units, std::int32_t* previous);

/// Reads the count without changing it. On failure @p value stays as it was.
bool count(PlatformSemaphore* handle, std::int32_t& value);

/// Closes the handle; null does nothing.
void close(PlatformSemaphore* handle);

/// Code of the calling thread's last failed call.
int lastError();

/// The reason of the calling thread's last failed open, create or duplicate in words; valid until its next one.
const char* explainLastError();

}  // namespace NamedSemaphore
