// One parameter of a keyword, declared once: its name, where it lives in its object, its kind and quantity.
// Reading, writing, comparison, export and grid columns all walk arrays of these.
#pragma once

#include "base/unit_group.h"

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <type_traits>
#include <vector>

class ExtraParams;
class HD_RiverPos;

/// A calendar date and time as a file stores it. The six integers are kept even when they are no date.
struct HDDateTime
{
    std::int32_t Year = 0, Month = 0, Day = 0, Hour = 0, Minute = 0, Second = 0;

    /// Local time now, to the second.
    static HDDateTime Now();
    /// Whether the six integers are a date and time of the Gregorian calendar (years 100 to 9999).
    bool IsValid() const;
    friend bool operator==(const HDDateTime&, const HDDateTime&) = default;
};

enum class FieldKind
{
    Number,   // double, in the base unit of its group
    Integer,  // std::int32_t
    Choice,   // std::int32_t, an index into a list of texts
    Boolean,  // bool
    Text,     // std::string
    FileName, // std::string
    DateTime, // HDDateTime: six integers in the file
    Group     // a count, then that many elements
};

struct Field;

/// How the elements of a repeated group are reached. `container` is the address that Field::address gives.
struct GroupAccess
{
    std::span<const Field> elements; // fields of one element, in file order
    bool padWhenEmpty = false;       // an empty group is followed by one element with default values
    std::size_t (*size)(const void* container) = nullptr;
    void (*resize)(void* container, std::size_t count) = nullptr;
    void* (*at)(void* container, std::size_t index) = nullptr;
    ExtraParams* (*extra)(void* element) = nullptr; // what a file holds behind the element's fields; may be null
};

struct Field
{
    std::string_view name;
    FieldKind kind = FieldKind::Number;
    UnitGroup unit = UnitGroup::None;
    bool optionalTail = false;                // read only when the keyword has parameters left; always written
    void* (*address)(void* object) = nullptr; // a location record is passed as its HD_RiverPos
    const GroupAccess* group = nullptr;       // Group only

    /// The value inside `object`, of the type that the kind says.
    template <typename T>
    T& In(void* object) const
    {
        return *static_cast<T*>(address(object));
    }
    template <typename T>
    const T& In(const void* object) const
    {
        return *static_cast<const T*>(address(const_cast<void*>(object)));
    }
    /// Number of file parameters: 1, 6 for a date-time, 0 for a group (depends on its count).
    std::size_t FixedParams() const { return kind == FieldKind::DateTime ? 6 : kind == FieldKind::Group ? 0 : 1; }
};

using FieldList = std::span<const Field>;

namespace field_detail {

template <typename>
struct MemberOf;
template <typename C, typename M>
struct MemberOf<M C::*>
{
    using Class = C;
    using Type = M;
};

/// The object as the class that declares the member. Records travel as their base class.
template <typename Class>
Class* Object(void* object)
{
    if constexpr (std::is_base_of_v<HD_RiverPos, Class>)
        return static_cast<Class*>(static_cast<HD_RiverPos*>(object));
    else
        return static_cast<Class*>(object);
}
/// A member, or a member of a member.
template <auto Member, auto... Inner>
void* Address(void* object)
{
    return &((Object<typename MemberOf<decltype(Member)>::Class>(object)->*Member).*....*Inner);
}
template <std::size_t Index, auto Member, auto... Inner>
void* ElementAddress(void* object)
{
    return &((Object<typename MemberOf<decltype(Member)>::Class>(object)->*Member).*....*Inner)[Index];
}
inline void* Identity(void* object)
{
    return object;
}

template <typename Container>
std::size_t Size(const void* container)
{
    return static_cast<const Container*>(container)->size();
}
template <typename Container>
void Resize(void* container, std::size_t count)
{
    static_cast<Container*>(container)->resize(count);
}
template <typename Container>
void* At(void* container, std::size_t index)
{
    return &(*static_cast<Container*>(container))[index];
}
template <typename Element>
ExtraParams* Extra(void* element)
{
    return &static_cast<Element*>(element)->Extra;
}
template <typename Container>
constexpr auto ExtraAccess() -> ExtraParams* (*)(void*)
{
    if constexpr (requires(typename Container::value_type element) { element.Extra; })
        return &Extra<typename Container::value_type>;
    else
        return nullptr;
}

} // namespace field_detail

// Declaring fields: Number<&HD_Initial::InitialH>("InitialH", UnitGroup::WaterLevel), or, for a member of a member,
// Number<&HD_Global_Var::HeatBalance, &HDHeatBalance::Latitude>("Latitude", UnitGroup::GeoAngle).
template <auto... Path>
constexpr Field Number(std::string_view name, UnitGroup unit = UnitGroup::None)
{
    return {name, FieldKind::Number, unit, false, &field_detail::Address<Path...>};
}
/// Element `Index` of an array member.
template <std::size_t Index, auto... Path>
constexpr Field NumberAt(std::string_view name, UnitGroup unit = UnitGroup::None)
{
    return {name, FieldKind::Number, unit, false, &field_detail::ElementAddress<Index, Path...>};
}
template <std::size_t Index, auto... Path>
constexpr Field BooleanAt(std::string_view name)
{
    return {name, FieldKind::Boolean, UnitGroup::None, false, &field_detail::ElementAddress<Index, Path...>};
}
template <auto... Path>
constexpr Field Scalar(FieldKind kind, std::string_view name)
{
    return {name, kind, UnitGroup::None, false, &field_detail::Address<Path...>};
}
template <auto... Path>
constexpr Field Integer(std::string_view name)
{
    return Scalar<Path...>(FieldKind::Integer, name);
}
template <auto... Path>
constexpr Field Choice(std::string_view name)
{
    return Scalar<Path...>(FieldKind::Choice, name);
}
template <auto... Path>
constexpr Field Boolean(std::string_view name)
{
    return Scalar<Path...>(FieldKind::Boolean, name);
}
template <auto... Path>
constexpr Field Text(std::string_view name)
{
    return Scalar<Path...>(FieldKind::Text, name);
}
template <auto... Path>
constexpr Field FileName(std::string_view name)
{
    return Scalar<Path...>(FieldKind::FileName, name);
}
template <auto... Path>
constexpr Field DateTime(std::string_view name)
{
    return Scalar<Path...>(FieldKind::DateTime, name);
}
/// The element of a group of plain values (a list of strings, of numbers).
constexpr Field Plain(FieldKind kind, std::string_view name, UnitGroup unit = UnitGroup::None)
{
    return {name, kind, unit, false, &field_detail::Identity};
}
constexpr Field Optional(Field field)
{
    field.optionalTail = true;
    return field;
}
template <typename Container>
constexpr GroupAccess GroupOf(FieldList elements, bool padWhenEmpty = false)
{
    return {elements,
            padWhenEmpty,
            &field_detail::Size<Container>,
            &field_detail::Resize<Container>,
            &field_detail::At<Container>,
            field_detail::ExtraAccess<Container>()};
}
template <auto... Path>
constexpr Field Group(std::string_view name, const GroupAccess& access)
{
    return {name, FieldKind::Group, UnitGroup::None, false, &field_detail::Address<Path...>, &access};
}
