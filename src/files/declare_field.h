// How fields are declared:
//
//     Number<&HD_Global_Var::delta>("delta", UnitGroup::Factor).Range(0.5, 1).Digits(2)
//
// A member of a member is a path: Number<&HD_Global_Var::HeatBalance, &HDHeatBalance::Latitude>("Latitude", ...). The
// kind is checked against the member's type, and an array of fields against its class; the default is the member's
// initialiser.
#pragma once

#include "files/field.h"

#include <array>
#include <concepts>
#include <cstdlib>
#include <utility>

namespace field_detail {

template <typename Class>
inline constexpr char Tag = 0;

/// What a path of members leads from and to.
template <typename>
struct MemberOf;
template <typename C, typename M>
struct MemberOf<M C::*>
{
    using Class = C;
    using Type = M;
};
template <auto First, auto... Inner>
struct Path
{
    using Class = typename MemberOf<decltype(First)>::Class;
    static constexpr auto& Of(auto& object) { return ((object.*First).*....*Inner); }
    using Type = std::remove_reference_t<decltype(((std::declval<Class&>().*First).*....*Inner))>;
};
template <std::size_t Index, auto... Members>
struct ElementPath
{
    using Class = typename Path<Members...>::Class;
    using Array = typename Path<Members...>::Type;
    using Type = std::conditional_t<(Index < std::extent_v<Array>), std::remove_extent_t<Array>, void>;
    static constexpr auto& Of(auto& object) { return Path<Members...>::Of(object)[Index]; }
};
/// An element that is the value itself.
template <typename T>
struct Self
{
    using Class = T;
    using Type = T;
    static constexpr auto& Of(auto& object) { return object; }
};

/// A class of objects that are passed as such.
template <typename Class>
struct Passed
{
    using As = Class;
};
/// One of a family whose objects are kept and passed as their base.
template <typename Class>
requires requires
{
    typename Class::PassedAs;
}
struct Passed<Class>
{
    using As = typename Class::PassedAs;
};

/// The object as the class that declares the member.
template <typename Class, typename Void>
auto& Object(Void* object)
{
    using Base = typename Passed<Class>::As;
    if constexpr (std::is_const_v<Void>)
        return static_cast<const Class&>(*static_cast<const Base*>(object));
    else
        return static_cast<Class&>(*static_cast<Base*>(object));
}
template <typename To, typename Void>
Void* Address(Void* object)
{
    return &To::Of(Object<typename To::Class>(object));
}
template <typename To>
constexpr Field Declare(FieldKind kind, std::string_view name, UnitGroup unit = UnitGroup::None)
{
    return {.name = name,
            .kind = kind,
            .owner = &Tag<typename To::Class>,
            .address = &Address<To, void>,
            .constAddress = &Address<To, const void>,
            .unit = unit};
}

template <typename Container, auto Elements>
constexpr GroupAccess MakeAccess()
{
    using Element = typename Container::value_type;
    GroupAccess access{
        .owner = &Tag<Element>,
        .elements = Elements,
        .size = [](const void* container) { return static_cast<const Container*>(container)->size(); },
        .resize = [](void* container, std::size_t count) { static_cast<Container*>(container)->resize(count); },
        .at = [](void* container, std::size_t index) -> void* { return &(*static_cast<Container*>(container))[index]; },
        .constAt = [](const void* container, std::size_t index) -> const void* {
            return &(*static_cast<const Container*>(container))[index];
        },
        .extra = {},
        .constExtra = {}};
    if constexpr (requires(Element element) { element.Extra; }) {
        access.extra = [](void* element) { return &static_cast<Element*>(element)->Extra; };
        access.constExtra = [](const void* element) { return &static_cast<const Element*>(element)->Extra; };
    }
    return access;
}
inline FieldList NoFields()
{
    return {};
}
template <const Field& element>
FieldList ElementList()
{
    return {&element, 1};
}
template <typename Container, auto Elements>
inline constexpr GroupAccess Access = MakeAccess<Container, Elements>();

} // namespace field_detail

/// The class as which a pointer to an object without type is taken: its own, or `Class::PassedAs` where it says so.
template <typename Class>
using PassedAs = typename field_detail::Passed<Class>::As;

/// Which of an object's fields holds the value at that address; null for none.
inline const Field* FindField(FieldList fields, const void* object, const void* value)
{
    for (const Field& field : fields)
        if (field.constAddress(object) == value)
            return &field;
    return nullptr;
}
/// The declaration of a member; one without ends the program.
template <typename Class, typename T>
const Field& FieldOf(T Class::*member)
{
    static const Class object{};
    const Field* const field =
        FindField(Class::DeclaredFields(), static_cast<const PassedAs<Class>*>(&object), &(object.*member));
    if (!field)
        std::abort();
    return *field;
}

/// That a path of members leads to a value of the type.
template <typename T, auto... Path>
concept LeadsTo = std::same_as<typename field_detail::Path<Path...>::Type, T>;

template <auto... Path>
requires LeadsTo<double, Path...>
constexpr Field Number(std::string_view name, UnitGroup unit = UnitGroup::None)
{
    return field_detail::Declare<field_detail::Path<Path...>>(FieldKind::Number, name, unit);
}
/// A number that is reached by `Way::Of(object)`, where its class gives no member; `Way::Class` is that class.
template <typename Way>
requires requires(typename Way::Class& object)
{
    { Way::Of(object) } -> std::same_as<double&>;
}
constexpr Field NumberBy(std::string_view name, UnitGroup unit = UnitGroup::None)
{
    return field_detail::Declare<Way>(FieldKind::Number, name, unit);
}
template <auto... Path>
requires LeadsTo<std::int32_t, Path...>
constexpr Field Integer(std::string_view name)
{
    return field_detail::Declare<field_detail::Path<Path...>>(FieldKind::Integer, name);
}
template <auto... Path>
requires LeadsTo<bool, Path...>
constexpr Field Boolean(std::string_view name)
{
    return field_detail::Declare<field_detail::Path<Path...>>(FieldKind::Boolean, name);
}
template <auto... Path>
requires LeadsTo<std::string, Path...>
constexpr Field Text(std::string_view name)
{
    return field_detail::Declare<field_detail::Path<Path...>>(FieldKind::Text, name);
}
template <auto... Path>
requires LeadsTo<std::string, Path...>
constexpr Field FileName(std::string_view name)
{
    return field_detail::Declare<field_detail::Path<Path...>>(FieldKind::FileName, name);
}
template <auto... Path>
requires LeadsTo<HDDateTime, Path...>
constexpr Field DateTime(std::string_view name)
{
    return field_detail::Declare<field_detail::Path<Path...>>(FieldKind::DateTime, name);
}
/// Element `Index` of an array member.
template <std::size_t Index, auto... Path>
requires std::same_as < typename field_detail::ElementPath<Index, Path...>::Type,
double > constexpr Field NumberAt(std::string_view name, UnitGroup unit = UnitGroup::None)
{
    return field_detail::Declare<field_detail::ElementPath<Index, Path...>>(FieldKind::Number, name, unit);
}
template <std::size_t Index, auto... Path>
requires std::same_as < typename field_detail::ElementPath<Index, Path...>::Type,
bool > constexpr Field BooleanAt(std::string_view name)
{
    return field_detail::Declare<field_detail::ElementPath<Index, Path...>>(FieldKind::Boolean, name);
}

/// The fields of a class, which must all be its own.
template <typename Class, std::size_t Count>
consteval std::array<Field, Count> FieldsOf(const Field (&fields)[Count])
{
    std::array<Field, Count> checked{};
    for (std::size_t i = 0; i < Count; ++i) {
        if (fields[i].owner != &field_detail::Tag<Class>)
            throw "a field of another class";
        checked[i] = fields[i];
    }
    return checked;
}

/// A repeated group; `Elements()` lists the fields of one element.
template <auto Elements, auto... Path>
constexpr Field GroupOf(std::string_view name)
{
    Field field = field_detail::Declare<field_detail::Path<Path...>>(FieldKind::Group, name);
    field.group = &field_detail::Access<typename field_detail::Path<Path...>::Type, Elements>;
    return field;
}

/// Defines Class::DeclaredFields() as these fields, in which the class is called Self.
#define KVR_FIELDS(Class, ...)                                                                                         \
    FieldList Class::DeclaredFields()                                                                                  \
    {                                                                                                                  \
        using Self = Class;                                                                                            \
        static constexpr auto fields = FieldsOf<Self>({__VA_ARGS__});                                                  \
        return fields;                                                                                                 \
    }

/// A repeated group of structs: `Element::DeclaredFields()` lists the fields of one.
template <auto... Path>
constexpr Field Group(std::string_view name)
{
    return GroupOf<&field_detail::Path<Path...>::Type::value_type::DeclaredFields, Path...>(name);
}
/// Elements that sections of a file hold, which are declared there (declared_section.h).
template <auto... Path>
constexpr Field SectionGroup(std::string_view name)
{
    return GroupOf<&field_detail::NoFields, Path...>(name);
}
/// The one field of elements that are plain values.
template <typename T>
constexpr Field Plain(std::string_view name, UnitGroup unit = UnitGroup::None)
{
    constexpr FieldKind kind = std::is_same_v<T, double>         ? FieldKind::Number
                               : std::is_same_v<T, std::int32_t> ? FieldKind::Integer
                               : std::is_same_v<T, bool>         ? FieldKind::Boolean
                                                                 : FieldKind::Text;
    static_assert(kind != FieldKind::Text || std::is_same_v<T, std::string>);
    return field_detail::Declare<field_detail::Self<T>>(kind, name, unit);
}
/// A repeated group of plain values; `element` is the Plain field of one, with static storage.
template <const Field& element, auto... Path>
requires(element.owner == &field_detail::Tag<typename field_detail::Path<Path...>::Type::value_type>) constexpr Field
    PlainGroup(std::string_view name)
{
    return GroupOf<&field_detail::ElementList<element>, Path...>(name);
}
