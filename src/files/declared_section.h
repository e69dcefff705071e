// Whole files by declaration: what stands in a section, which object takes it, and reading that stops at the first
// thing that is not as declared. (Files of HD parameters are read past what is not in order: data/hd_parameters.h.)
#pragma once

#include "files/declare_field.h"
#include "files/unknown_content.h"
#include "tql/tql.h"

#include <optional>
#include <span>
#include <string_view>

enum class Presence
{
    Required,
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

/// Where reading stopped, and why.
struct ReadingFault
{
    enum Kind
    {
        NoTarget,   // `name` is there not even once; no place
        WrongValue, // the parameters of `name` are not those of `fields`
        Missing,    // a keyword of the section at the place
        NoSection,  // likewise a section
        Second      // `name` again, though one counts: it would be lost when the file is saved
    };
    Kind kind;
    tqlHandle place;
    std::string_view name, section;
    FieldList fields{};
};

/// Reads a loaded file into the object. On a fault the object holds part of it.
std::optional<ReadingFault> ReadDeclared(tqlHandle structure, const DeclaredFile& file, void* object);
/// Writes the object's file into a created structure, what was kept behind what is declared.
void WriteDeclared(tqlHandle structure, const DeclaredFile& file, const void* object);
