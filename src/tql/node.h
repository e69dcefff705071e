// What handles point to.
//
// Every handle is the address of a byte that says what it is: the nodes below begin with their kind, and a parameter is
// its own text, whose first character (a digit, a quote, ...) is none of the kinds. So a tree costs 16 bytes a keyword
// and nothing a parameter, and a handle of the wrong kind is recognised wherever it is passed.
#pragma once

#include "tql/tql.h"

#include <cstdint>
#include <deque>
#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace tql {

enum class Kind : std::uint8_t
{
    Structure = 1, // a loaded file
    Section,       // a target or a section
    Keyword,
    LongKeyword,
    Builder // a created structure
    // parameters: the characters from '"' (34) on
};

/// What does not fit the small node: a keyword of many parameters, or of a very long name.
struct LongKeyword
{
    std::string_view name;
    const char* params = nullptr;
    std::vector<std::uint32_t> starts; // of every parameter, from `params`
};

struct Keyword
{
    static constexpr std::size_t MaxParams = 16; // up to here a parameter is found by stepping through the line

    Kind kind = Kind::Keyword;
    std::uint8_t paramCount = 0;
    std::uint16_t nameLength = 0;
    std::uint32_t paramsOffset = 0; // from the name
    union {
        const char* name = nullptr;
        const LongKeyword* more;
    };

    bool IsLong() const { return kind == Kind::LongKeyword; }
    std::string_view Name() const { return IsLong() ? more->name : std::string_view(name, nameLength); }
    const char* Params() const { return IsLong() ? more->params : name + paramsOffset; }
    std::size_t ParamCount() const { return IsLong() ? more->starts.size() : paramCount; }
};
static_assert(sizeof(Keyword) == 16);

/// Where the occurrences of a name stand among the children of one parent, by position from 0.
using NameIndex = std::unordered_map<std::string_view, std::vector<std::uint32_t>>;

/// A target, a section, or (without a name) the file around the targets.
struct Section
{
    explicit Section(Kind itsKind = Kind::Section, std::string_view itsName = {}) : kind(itsKind), name(itsName) {}

    Kind kind;
    bool sameKeywordNames = true; // as in the lists; needs no index
    std::string_view name;
    std::vector<Section*> sections;
    std::vector<Keyword> keywords;
    std::unique_ptr<NameIndex> sectionIndex, keywordIndex; // made at the first look-up by name
};

/// The text of a file, framed so that scanning needs no bounds: a line feed and zeros stand behind it.
class Text
{
public:
    /// Uninitialised bytes to read into; Finish must follow.
    explicit Text(std::size_t size = 0);
    char* Data() { return m_bytes.get(); }
    const char* begin() const { return m_bytes.get() + m_begin; }
    const char* end() const { return m_bytes.get() + m_size; }
    std::size_t Size() const { return m_size; }
    /// Makes room for `size` bytes, keeping what is there.
    void Grow(std::size_t size);
    /// Cuts to the bytes really there and sets the frame; a byte-order mark falls off.
    void Finish(std::size_t size);

private:
    std::unique_ptr<char[]> m_bytes;
    std::size_t m_size = 0, m_begin = 0;
};

struct Structure : Section
{
    Structure() : Section(Kind::Structure) {}

    Text text;
    std::deque<Section> nodes;
    std::deque<LongKeyword> longKeywords;
    TqlSyntaxError error;
    std::vector<std::size_t> lineStarts; // made at the first position asked through the structure

    /// Drops everything but the error report.
    void Clear();
};

// ---- handles -----------------------------------------------------------------------------------

inline Kind KindOf(tqlHandle handle)
{
    return *reinterpret_cast<const Kind*>(handle);
}

inline bool IsParam(tqlHandle handle)
{
    return handle && static_cast<unsigned char>(KindOf(handle)) >= '"';
}

template <typename Node>
tqlHandle HandleOf(Node* node)
{
    return reinterpret_cast<tqlHandle>(const_cast<std::remove_const_t<Node>*>(node));
}

inline const char* AsParam(tqlHandle handle)
{
    return IsParam(handle) ? reinterpret_cast<const char*>(handle) : nullptr;
}
inline Structure* AsStructure(tqlHandle handle)
{
    return handle && KindOf(handle) == Kind::Structure ? reinterpret_cast<Structure*>(handle) : nullptr;
}
/// Anything that can hold sections: a structure too.
inline Section* AsParent(tqlHandle handle)
{
    if (handle && KindOf(handle) == Kind::Section)
        return reinterpret_cast<Section*>(handle);
    return AsStructure(handle);
}
inline const Keyword* AsKeyword(tqlHandle handle)
{
    const bool is = handle && (KindOf(handle) == Kind::Keyword || KindOf(handle) == Kind::LongKeyword);
    return is ? reinterpret_cast<const Keyword*>(handle) : nullptr;
}

// ---- errors ------------------------------------------------------------------------------------

void SetGlobalError(TqlError code);

} // namespace tql
