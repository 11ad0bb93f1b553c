#include "support/AllocationMeter.h"

#include <algorithm>
#include <cstdlib>
#include <malloc.h>
#include <new>

namespace orvane
{

namespace
{

thread_local AllocationMeter* innermost = nullptr;

constexpr std::size_t kHeaderBytes = 8;

} // namespace

AllocationMeter::AllocationMeter() : _outer(innermost) { innermost = this; }

AllocationMeter::~AllocationMeter() { innermost = _outer; }

void AllocationMeter::allocated(void* memory)
{
    if (!innermost || !memory)
        return;
    innermost->_bytes += static_cast<std::ptrdiff_t>(malloc_usable_size(memory) + kHeaderBytes);
    ++innermost->_allocations;
    if (innermost->_bytes > 0)
        innermost->_peakBytes =
            std::max(innermost->_peakBytes, static_cast<std::size_t>(innermost->_bytes));
}

void AllocationMeter::released(void* memory)
{
    if (innermost && memory)
        innermost->_bytes -= static_cast<std::ptrdiff_t>(malloc_usable_size(memory) + kHeaderBytes);
}

} // namespace orvane

#if !ORVANE_ADDRESS_SANITIZER

void* operator new(std::size_t size)
{
    void* const memory = std::malloc(size == 0 ? 1 : size);
    if (!memory)
        throw std::bad_alloc();
    orvane::AllocationMeter::allocated(memory);
    return memory;
}

void operator delete(void* memory) noexcept
{
    orvane::AllocationMeter::released(memory);
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept { operator delete(memory); }

#endif
