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
#include <initializer_list>
#include <string>

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

// One row of a slot table: the member's name (for the failure text) and its slot.
struct SlotRow
{
    const char* name;
    std::ptrdiff_t slot;
};
#define ZEL_SLOT_ROW(Class, member) SlotRow{#member, vtableSlot(&Class::member)}

// The rows whose slots do not run first, first + 1, ... in table order, as
// "name=slot (want n)" words; empty when every row is in its place.
inline std::string slotsOutOfOrder(std::ptrdiff_t first, std::initializer_list<SlotRow> rows)
{
    std::string wrong;
    for (const SlotRow& row : rows) {
        if (row.slot != first)
            wrong += std::string(row.name) + "=" + std::to_string(row.slot) + " (want " + std::to_string(first) + ") ";
        ++first;
    }
    return wrong;
}

#endif
