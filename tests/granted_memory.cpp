#include "granted_memory.h"

#include <cstdlib>
#include <new>

namespace GrantedMemory {

long granted = unlimited;
bool refusesForGood = false, refused = false;

static bool Grants()
{
    if (granted == unlimited)
        return true;
    if (granted > 0)
        return granted-- > 0;
    refused = true;
    if (!refusesForGood)
        granted = unlimited;
    return false;
}

} // namespace GrantedMemory

// All of them: a sanitizer has its own of each, which do not go together with these.

void* operator new(std::size_t size, const std::nothrow_t&) noexcept
{
    return GrantedMemory::Grants() ? std::malloc(size ? size : 1) : nullptr;
}

void* operator new(std::size_t size)
{
    void* const memory = operator new(size, std::nothrow);
    if (!memory)
        throw std::bad_alloc();
    return memory;
}

void* operator new[](std::size_t size)
{
    return operator new(size);
}

void* operator new[](std::size_t size, const std::nothrow_t&) noexcept
{
    return operator new(size, std::nothrow);
}

void operator delete(void* memory) noexcept
{
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept
{
    std::free(memory);
}

void operator delete(void* memory, const std::nothrow_t&) noexcept
{
    std::free(memory);
}

void operator delete[](void* memory) noexcept
{
    std::free(memory);
}

void operator delete[](void* memory, std::size_t) noexcept
{
    std::free(memory);
}

void operator delete[](void* memory, const std::nothrow_t&) noexcept
{
    std::free(memory);
}
