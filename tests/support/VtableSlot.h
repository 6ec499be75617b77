// Test support: the vtable slot of a virtual member function.
//
// Under the Itanium C++ ABI (g++, clang) a pointer to a virtual member function
// holds its vtable offset + 1, so slot order can be asserted. A virtual
// destructor takes two slots (0 and 1) when it is declared first.
#ifndef ZEL_TESTS_VTABLESLOT_H
#define ZEL_TESTS_VTABLESLOT_H

#include <cstddef>
#include <cstdint>
#include <cstring>

template <typename MemberFunction>
std::ptrdiff_t vtableSlot(MemberFunction function)
{
    static_assert(sizeof(MemberFunction) == 2 * sizeof(void*), "Itanium ABI member pointer expected");
    std::uintptr_t representation[2];
    std::memcpy(representation, &function, sizeof representation);
    if ((representation[0] & 1u) == 0)
        return -1; // not virtual
    return static_cast<std::ptrdiff_t>((representation[0] - 1) / sizeof(void*));
}

#endif
