#pragma once

#include "support/Sanitizers.h"

#include <cstddef>

namespace orvane
{

// Measures what the thread allocates with operator new while it exists: memory and steps that are
// the same on every run, where a clock or the process's size would not be. Meters may be nested;
// only the innermost counts.
//
// Does not work under the address sanitizer, which needs operator new for itself: isAvailable is
// false there.
class AllocationMeter
{
public:
    static constexpr bool isAvailable = !ORVANE_ADDRESS_SANITIZER;

    AllocationMeter();
    ~AllocationMeter();
    AllocationMeter(const AllocationMeter&) = delete;
    AllocationMeter& operator=(const AllocationMeter&) = delete;

    // The most bytes that were allocated at one time, with what each takes of the heap.
    [[nodiscard]] std::size_t peakBytes() const { return _peakBytes; }
    [[nodiscard]] std::size_t allocations() const { return _allocations; }

    // For operator new and delete alone.
    static void allocated(void* memory);
    static void released(void* memory);

private:
    AllocationMeter* _outer;
    std::ptrdiff_t _bytes = 0; // negative where what came before is released
    std::size_t _peakBytes = 0;
    std::size_t _allocations = 0;
};

} // namespace orvane
