// One parameter of a keyword, declared once (declare_field.h): its name, the member that holds it, and all else that is
// known about it. Reading, writing, comparison, export, grid columns and single fields all walk arrays of these.
#pragma once

#include "base/unit_group.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <type_traits>

class ExtraParams;
enum class Str : int; // the number of a text; who gives one knows the table

/// A calendar date and time as a file stores it. The six integers are kept even when they are no date.
struct HDDateTime
{
    std::int32_t Year = 0, Month = 0, Day = 0, Hour = 0, Minute = 0, Second = 0;

    /// Local time now, to the second; what DatedObjects say while there are such.
    static HDDateTime Now();
    /// Whether the six integers are a date and time of the Gregorian calendar (years 100 to 9999).
    bool IsValid() const;
    friend bool operator==(const HDDateTime&, const HDDateTime&) = default;
};

/// While one lives, what this thread makes has this date - which may be one that is not set - where it would take the
/// time now, for whoever reads files and must get the same from the same file.
class DatedObjects
{
public:
    explicit DatedObjects(const HDDateTime& date);
    ~DatedObjects();
    DatedObjects(const DatedObjects&) = delete;
    DatedObjects& operator=(const DatedObjects&) = delete;

private:
    const HDDateTime* m_before;
    HDDateTime m_date;
};

enum class FieldKind
{
    Number,   // double, in the base unit of its group
    Integer,  // std::int32_t; with choices an index into a list of texts
    Boolean,  // bool
    Text,     // std::string
    FileName, // std::string
    DateTime, // HDDateTime: six integers in the file
    Group     // a count, then that many elements
};

struct Field;
using FieldList = std::span<const Field>;

/// How the elements of a repeated group are reached. `container` is the address that Field::address gives.
struct GroupAccess
{
    const void* owner;       // the tag of the elements' class
    FieldList (*elements)(); // fields of one element, in file order
    std::size_t (*size)(const void* container);
    void (*resize)(void* container, std::size_t count);
    void* (*at)(void* container, std::size_t index);
    const void* (*constAt)(const void* container, std::size_t index);
    ExtraParams* (*extra)(void* element); // what a file holds behind the element's fields; null where nothing is kept
    const ExtraParams* (*constExtra)(const void* element);
};

/// What a number at a location is along its branch.
enum class Along
{
    Value,
    Elevation, // above datum, as the ground and the water
    ReachEnd   // the chainage where a reach ends that starts at the location
};

/// One line of a text that holds several, or the whole of it.
struct TextLine
{
    static constexpr int Whole = -1;

    Str text{};
    int line = Whole;
    const char* source = nullptr; // the text itself, to be translated, where an editor has no numbers for its texts

    constexpr TextLine() = default;
    constexpr TextLine(Str itsText, int itsLine = Whole) : text(itsText), line(itsLine) {}
    constexpr TextLine(const char* itsSource) : source(itsSource) {}

    explicit constexpr operator bool() const { return text != Str{} || source; }
};

/// The value of a group: the elements of a container. `Void` is const for an object that is.
template <typename Void>
class GroupValue
{
public:
    using Extra = std::conditional_t<std::is_const_v<Void>, const ExtraParams, ExtraParams>;

    GroupValue(const Field& field, Void* container) : m_field(&field), m_container(container) {}

    FieldList Elements() const { return Access().elements(); }
    std::size_t size() const { return Access().size(m_container); }
    Void* operator[](std::size_t index) const
    {
        if constexpr (std::is_const_v<Void>)
            return Access().constAt(m_container, index);
        else
            return Access().at(m_container, index);
    }
    /// Elements with their defaults; what the group held is gone.
    void Renew(std::size_t count) const requires(!std::is_const_v<Void>)
    {
        Access().resize(m_container, 0);
        Access().resize(m_container, count);
    }
    /// The first elements stay; others have their defaults.
    void Resize(std::size_t count) const requires(!std::is_const_v<Void>) { Access().resize(m_container, count); }
    /// Null where nothing is kept.
    Extra* ExtraOf(std::size_t index) const
    {
        if (!Access().extra)
            return nullptr;
        if constexpr (std::is_const_v<Void>)
            return Access().constExtra((*this)[index]);
        else
            return Access().extra((*this)[index]);
    }

private:
    inline const GroupAccess& Access() const;

    const Field* m_field;
    Void* m_container;
};

/// What a user may enter as a number, in base units.
struct Bounds
{
    std::optional<double> minimum{}, maximum{};

    /// A value that is not known is within them.
    constexpr bool Allow(double value) const
    {
        return !(minimum && value < *minimum) && !(maximum && value > *maximum);
    }
    bool operator==(const Bounds&) const = default;
};

struct Field
{
    std::string_view name;
    FieldKind kind = FieldKind::Number;
    const void* owner = nullptr; // the tag of the class that declares the member
    // The object is passed as PassedAs<its class> (declare_field.h).
    void* (*address)(void* object) = nullptr;
    const void* (*constAddress)(const void* object) = nullptr;
    const GroupAccess* group = nullptr; // Group only
    UnitGroup unit = UnitGroup::None;
    bool optionalTail = false; // read only when the keyword has parameters left; always written
    bool mayBeUnknown = false; // a number: not a number stands for one that is not known
    bool padWhenEmpty = false; // an empty group is followed by one element with default values
    TextLine title{};
    TextLine meaning{};           // what the value is to the flow computation, in a sentence or two
    TextLine choices{};           // the texts of an integer's indices, one a line; for a text what it may be
    std::int32_t firstChoice = 0; // the index of the first of them
    int digits = 0;               // significant ones, where a number is shown; 0 for the usual
    Bounds bounds{};
    Along along = Along::Value;

    // What else a declaration says, one after the other.
    template <typename Value>
    constexpr Field With(Value Field::*member, std::type_identity_t<Value> value) const
    {
        Field field = *this;
        field.*member = value;
        return field;
    }
    constexpr Field Title(TextLine text) const { return With(&Field::title, text); }
    constexpr Field Title(Str text, int line) const { return Title({text, line}); }
    constexpr Field Means(TextLine text) const { return With(&Field::meaning, text); }
    constexpr Field Means(Str text, int line) const { return Means({text, line}); }
    constexpr Field Choices(TextLine texts, std::int32_t first = 0) const
    {
        if (kind != FieldKind::Integer && kind != FieldKind::Boolean && kind != FieldKind::Text)
            throw "choices of what is neither the number of an entry nor its text";
        return With(&Field::choices, texts).With(&Field::firstChoice, first);
    }
    constexpr Field Range(std::optional<double> least, std::optional<double> most = {}) const
    {
        if (kind != FieldKind::Number)
            throw "bounds of what is no number";
        if (least && most && *least > *most)
            throw "bounds that no number keeps";
        return With(&Field::bounds, {least, most});
    }
    constexpr Field Digits(int significant) const
    {
        if (kind != FieldKind::Number)
            throw "digits of what is no number";
        return With(&Field::digits, significant);
    }
    constexpr Field Is(Along what) const
    {
        if (kind != FieldKind::Number)
            throw "only a number is something along a branch";
        return With(&Field::along, what);
    }
    constexpr Field OptionalTail() const { return With(&Field::optionalTail, true); }
    constexpr Field MayBeUnknown() const
    {
        if (kind != FieldKind::Number)
            throw "only a number may be unknown";
        return With(&Field::mayBeUnknown, true);
    }
    constexpr Field PadWhenEmpty() const { return With(&Field::padWhenEmpty, true); }

    /// The value inside `object`, of the type that the kind says.
    template <typename T>
    T& In(void* object) const
    {
        return *static_cast<T*>(address(object));
    }
    template <typename T>
    const T& In(const void* object) const
    {
        return *static_cast<const T*>(constAddress(object));
    }
    GroupValue<void> GroupIn(void* object) const { return {*this, address(object)}; }
    GroupValue<const void> GroupIn(const void* object) const { return {*this, constAddress(object)}; }
    /// Number of file parameters: 1, 6 for a date-time, 0 for a group (depends on its count).
    std::size_t FixedParams() const { return kind == FieldKind::DateTime ? 6 : kind == FieldKind::Group ? 0 : 1; }
};

template <typename Void>
const GroupAccess& GroupValue<Void>::Access() const
{
    return *m_field->group;
}

/// Stands for the type of a group, whose elements have a type each.
struct GroupType
{
};

/// Calls `visit` with std::type_identity of the type that values of the kind have.
template <typename Visitor>
decltype(auto) VisitKind(FieldKind kind, Visitor&& visit)
{
    switch (kind) {
    case FieldKind::Number:
        return visit(std::type_identity<double>{});
    case FieldKind::Integer:
        return visit(std::type_identity<std::int32_t>{});
    case FieldKind::Boolean:
        return visit(std::type_identity<bool>{});
    case FieldKind::Text:
    case FieldKind::FileName:
        return visit(std::type_identity<std::string>{});
    case FieldKind::DateTime:
        return visit(std::type_identity<HDDateTime>{});
    case FieldKind::Group:
        break;
    }
    return visit(std::type_identity<GroupType>{});
}

/// Functions of several types of value as one visitor.
template <typename... Functions>
struct Overloads : Functions...
{
    using Functions::operator()...;
};
template <typename... Functions>
Overloads(Functions...) -> Overloads<Functions...>;

/// Calls `visit` with the field's value in `object`: double, std::int32_t, bool, std::string, HDDateTime or GroupValue,
/// const where the object is.
template <typename Object, typename Visitor>
decltype(auto) Visit(const Field& field, Object* object, Visitor&& visit)
{
    using Void = std::conditional_t<std::is_const_v<Object>, const void, void>;
    return VisitKind(field.kind, [&]<typename T>(std::type_identity<T>) -> decltype(auto) {
        if constexpr (std::is_same_v<T, GroupType>)
            return visit(field.GroupIn(static_cast<Void*>(object)));
        else
            return visit(field.In<T>(static_cast<Void*>(object)));
    });
}
