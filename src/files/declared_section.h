// Sections and whole files by declaration: what stands in a section, and which object takes it. Reading goes past what
// is not as declared, with a report of it.
#pragma once

#include "base/result.h"
#include "files/declare_field.h"
#include "files/extra_params.h"
#include "files/finding.h"
#include "files/safe_file.h"
#include "files/unknown_content.h"

#include <functional>
#include <map>
#include <optional>
#include <span>
#include <string>
#include <string_view>

enum class Presence
{
    Required, // that it is missing is reported
    Optional, // always written
    WhenSet,  // written unless it is an empty text
    EachLine  // of a single group: one keyword an element
};

/// A keyword, whose parameters are fields.
struct DeclaredKeyword
{
    std::string_view name;
    Field single{};
    FieldList several{};
    Presence presence = Presence::Required;
    std::string_view onlyWith{}; // a keyword of its section, without which it is not read

    /// Of one parameter that is named like the keyword.
    constexpr DeclaredKeyword(const Field& field, std::string_view with = {})
        : name(field.name), single(field), presence(Presence::Optional), onlyWith(with)
    {
    }
    constexpr DeclaredKeyword(std::string_view keyword, FieldList fields, Presence itsPresence = Presence::Required)
        : name(keyword), several(fields), presence(itsPresence)
    {
    }

    constexpr FieldList Fields() const { return several.empty() ? FieldList(&single, 1) : several; }
};

/// What an object keeps of a file beside its fields.
struct KeptContent
{
    struct Keyword
    {
        ExtraParams extra;                   // behind its own parameters
        std::optional<std::string> unread{}; // all of them, where the keyword that it goes with is missing
        std::string whenUnread{};            // the values of the two at that time
    };

    /// By the names of known sections; what stands beside a target, by none.
    std::map<std::string_view, UnknownNodes> sections;
    std::map<const DeclaredKeyword*, Keyword> keywords;
};
/// How an object is asked for that.
struct KeptAccess
{
    const void* owner; // the tag of the object's class
    KeptContent& (*of)(void* object);
    const KeptContent& (*constOf)(const void* object);
};
template <auto Member>
constexpr KeptAccess Keeps()
{
    using Class = typename field_detail::MemberOf<decltype(Member)>::Class;
    return {&field_detail::Tag<Class>,
            [](void* object) -> KeptContent& { return static_cast<Class*>(object)->*Member; },
            [](const void* object) -> const KeptContent& { return static_cast<const Class*>(object)->*Member; }};
}

/// A section: keywords, then sections. It is read into the same object as the section around it, or, with `each`, one
/// section into each element of that group.
struct DeclaredSection
{
    std::string_view name;
    KeptAccess kept;
    std::span<const DeclaredKeyword> keywords{};
    const DeclaredSection* sections = nullptr;
    std::size_t sectionCount = 0;
    const Field* each = nullptr;
    bool required = false;

    constexpr std::span<const DeclaredSection> Sections() const { return {sections, sectionCount}; }
};

namespace field_detail {

consteval bool IsOf(const void* owner, const DeclaredSection& section)
{
    if (section.each) {
        if (section.each->owner != owner)
            return false;
        owner = section.each->group->owner;
    }
    if (section.kept.owner != owner)
        return false;
    for (const DeclaredKeyword& keyword : section.keywords)
        for (const Field& field : keyword.Fields())
            if (field.owner != owner)
                return false;
    for (const DeclaredSection& inner : section.Sections())
        if (!IsOf(owner, inner))
            return false;
    return true;
}

} // namespace field_detail

/// Whether all that a section is read into is a class's own, and what stands in sections of a group that of its
/// elements' class. The elements of other groups are checked where they are declared.
template <typename Class>
consteval bool IsOf(const DeclaredSection& section)
{
    return field_detail::IsOf(&field_detail::Tag<Class>, section);
}

/// Reads a section of `parent`, where there is one, into the object, and keeps everything: a value that is no finite
/// number, a line that is not whole, and what stands behind the parameters of a keyword.
void ReadDeclared(tqlHandle parent, const DeclaredSection& section, void* object, LoadReport* report);
/// Appends the section to what is being written; what was kept stands behind what is declared.
void WriteDeclared(tqlHandle structure, const DeclaredSection& section, const void* object);

/// Reads a loaded file by its target, strictly: the first of what stands there once, all of what repeats, finite
/// numbers. What is missing or of another type keeps its value; a file without the target is reported as such and not
/// read.
void ReadDeclaredFile(tqlHandle structure, const DeclaredSection& target, void* object, LoadReport& report);
/// Reports that occurrence `number` of a section's keyword - the section, when it is missing - breaks a rule beyond its
/// declaration. `used`: what is used instead, in file notation.
void ReportRule(LoadReport& report, tqlHandle section, std::string_view name, int number, std::string used,
                std::function<std::string()> rule);
/// Puts the object's file into the place of `path` (safe_file.h); what was kept stands behind what is declared.
Result<WriteReport> SaveDeclaredFile(const std::string& path, const DeclaredSection& target, const void* object,
                                     const SafeFileOptions& options = {});
/// The text of that file; an error where it cannot be expressed in one.
Result<std::string> DeclaredText(const DeclaredSection& target, const void* object);
