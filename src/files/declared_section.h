// Whole files by declaration: what stands in a section, and which object takes it. Reading goes past what is not as
// declared, with a report of it.
#pragma once

#include "base/result.h"
#include "files/declare_field.h"
#include "files/finding.h"
#include "files/unknown_content.h"

#include <functional>
#include <span>
#include <string_view>

enum class Presence
{
    Required, // that it is missing is reported
    Optional, // always written
    WhenSet   // written unless it is an empty text
};

/// A keyword, whose parameters are fields; or, of a single group, one keyword an element.
struct DeclaredKeyword
{
    std::string_view name;
    FieldList fields;
    Presence presence = Presence::Required;
};

/// How an object is asked for its unknown content.
struct KeptContent
{
    UnknownNodes* (*of)(void* object) = nullptr;
    const UnknownNodes* (*constOf)(const void* object) = nullptr;
};
template <auto... Path>
constexpr KeptContent Keeps()
{
    using To = field_detail::Path<Path...>;
    return {[](void* object) { return &To::Of(*static_cast<typename To::Class*>(object)); },
            [](const void* object) { return &To::Of(*static_cast<const typename To::Class*>(object)); }};
}

/// A section: keywords, then sections. It is read into the same object as the section around it, or, with `each`, one
/// section into each element of that group.
struct DeclaredSection
{
    std::string_view name;
    KeptContent kept;
    std::span<const DeclaredKeyword> keywords{};
    const DeclaredSection* sections = nullptr;
    std::size_t sectionCount = 0;
    const Field* each = nullptr;
    bool required = false;

    std::span<const DeclaredSection> Sections() const { return {sections, sectionCount}; }
};

/// A file: one target that is read, and others that are kept.
struct DeclaredFile
{
    DeclaredSection target;
    KeptContent otherTargets;
};

/// Reads a loaded file into the object: the first of what stands there once, all of what repeats, finite numbers. What
/// is missing or of another type keeps its value; a file without the target is reported as such and not read.
void ReadDeclared(tqlHandle structure, const DeclaredFile& file, void* object, LoadReport& report);
/// Reports that occurrence `number` of a section's keyword - the section, when it is missing - breaks a rule beyond its
/// declaration. `used`: what is used instead, in file notation.
void ReportRule(LoadReport& report, tqlHandle section, std::string_view name, int number, std::string used,
                std::function<std::string()> rule);
/// Puts the object's file into the place of `path` (safe_file.h); what was kept stands behind what is declared.
Result<void> SaveDeclared(const std::string& path, const DeclaredFile& file, const void* object);
/// The text of that file; an error where it cannot be expressed in one.
Result<std::string> DeclaredText(const DeclaredFile& file, const void* object);
