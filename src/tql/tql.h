// The parameter-file library: sectioned text files of typed parameters.
//
// A file holds targets (top-level sections), these hold sections, these keywords, these parameters.
// Everything is reached through opaque handles; a null handle means "not found", and every operation
// accepts a null handle and answers as for something that is not there. A handle is valid until the
// structure it came from is closed. The library keeps no locks: one structure, one thread.
//
// The text layout is described in docs/format.md.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <system_error>
#include <variant>
#include <vector>

struct TqlNode; // never defined: handles are compared with null and passed back, nothing else
using tqlHandle = TqlNode*;

// ---- errors ------------------------------------------------------------------------------------

enum class TqlError : int
{
    None = 0,
    Unreadable, // missing, a folder, no permission, read failure
    Encoding,   // not UTF-8, or a NUL
    Syntax,     // anything the grammar refuses
    TooLarge,   // nesting deeper than 128, a line longer than 16 MiB, a file of 2 GiB
    Write       // tqlAppend could not write
};

/// What a message of the parser speaks of; their words are in tql/phrases.inc.
enum class TqlPhrase : std::uint8_t
{
    None,
#define TQL_PHRASE(name, english) name,
#include "tql/phrases.inc"
#undef TQL_PHRASE
};
/// The words in English, with %1 where a piece of the text goes.
const char* tqlPhraseText(TqlPhrase phrase);

/// A phrase with the piece of the text that it speaks of.
struct TqlTerm
{
    TqlPhrase phrase = TqlPhrase::None;
    std::string text{};
};

/// Where a load stopped and why. `message` is one sentence for the user, for example
/// "river.hdkv, line 812, column 14: expected [/InitList], found [/WindList]".
struct TqlSyntaxError
{
    TqlError code = TqlError::None;
    std::string file;       // name as given to the load, without its folder
    std::size_t line = 0;   // from 1; 0 when the file could not be read at all
    std::size_t column = 0; // from 1, in characters (code points)
    TqlTerm expected;       // these two only of a text that was read
    TqlTerm found;
    std::error_code reason; // of a file that could not be read
    std::string message;
};

/// Outcome of this thread's last load or append: 0, or the code of its error. Peek leaves it, Get clears it.
int tqlPeekErrorGlb();
int tqlGetErrorGlb();
/// Report of the structure's load error; false (and untouched) when it loaded well.
bool tqlGetSyntaxErr(tqlHandle structure, TqlSyntaxError* report);

// ---- loading -----------------------------------------------------------------------------------

/// Parses a whole file (path in UTF-8). `mode` is 1, read only. Never returns null: after an error the structure is
/// empty, holds only the error report and must still be closed.
tqlHandle tqlLoadFile(const std::string& path, int mode = 1);
/// The same for text in memory; `name` stands for the file in messages.
tqlHandle tqlLoadText(std::string text, const std::string& name);
/// The bytes that were parsed, as they were read. Valid as long as the structure; empty after an error.
std::string_view tqlGetSource(tqlHandle structure);
/// Releases a structure (loaded or created) and sets the handle to null.
void tqlClose(tqlHandle* structure);

// ---- looking up (numbers from 1) ---------------------------------------------------------------

tqlHandle tqlTargetByNameNum(tqlHandle structure, std::string_view name, int number);
tqlHandle tqlSectionByNameNum(tqlHandle parent, std::string_view name, int number);
tqlHandle tqlKeywordByNameNum(tqlHandle section, std::string_view name, int number);
tqlHandle tqlParamByNum(tqlHandle keyword, int number);
/// The parameter after this one in its keyword; null behind the last.
tqlHandle tqlNextParam(tqlHandle param);

/// Counts of direct children. For a structure, tqlGetNoSections counts its targets.
int tqlGetNoSections(tqlHandle parent);
int tqlGetNoKeywords(tqlHandle section);
/// Number of keywords of one name.
int tqlGetNoKeywords(tqlHandle section, std::string_view name);
int tqlGetNoParams(tqlHandle keyword);

/// Children by position, whatever their name (for walking a file).
tqlHandle tqlSectionByNum(tqlHandle parent, int number);
tqlHandle tqlKeywordByNum(tqlHandle section, int number);
/// Name of a target, section or keyword; empty for anything else. Valid as long as the structure.
std::string_view tqlName(tqlHandle node);

struct TqlPosition
{
    std::size_t line = 0, column = 0; // from 1; 0 for what was not loaded from a text
};
/// Where a section opens, a keyword's name or a parameter stands. The first call counts the structure's lines, the
/// others only look up.
TqlPosition tqlGetPosition(tqlHandle structure, tqlHandle node);

// ---- values ------------------------------------------------------------------------------------

enum class TqlType : std::uint8_t
{
    None,
    Int,
    Double,
    Bool,
    String,
    FileName
};
TqlType tqlGetType(tqlHandle param);

/// Each stores the parameter's value and returns true, or leaves `value` untouched and returns false when the
/// parameter is not there or is of another type. A float may be read from an integer parameter. tqlGetString reads
/// strings and file names.
bool tqlGetInt(tqlHandle param, std::int32_t* value);
bool tqlGetDouble(tqlHandle param, double* value);
bool tqlGetBool(tqlHandle param, bool* value);
bool tqlGetString(tqlHandle param, std::string* value);

/// The same, and the handle moves on to the next parameter (null behind the last) whatever the type was. The quick way
/// through all parameters of a keyword.
template <typename Value> // of the functions above
bool tqlTake(tqlHandle* param, Value* value);

using TqlOut = std::variant<std::int32_t*, double*, bool*, std::string*>;
/// Value of parameter `param` of occurrence `keyword` of the named keyword; same contract.
bool tqlGetParam(tqlHandle section, std::string_view name, TqlOut value, int keyword = 1, int param = 1);
bool tqlGetParamFilename(tqlHandle section, std::string_view name, std::string* value, int keyword = 1, int param = 1);
/// All parameters of one keyword by signature ("i" integer, "d" float, "b" boolean, "s" string, "n" file name), one
/// pointer a letter. All or nothing: false, and no pointer written, unless every parameter is there with its type.
bool tqlGetListParam(tqlHandle section, std::string_view name, int number, std::string_view signature,
                     const std::vector<TqlOut>& out);

/// The parameters of a loaded keyword exactly as they stand in its line (without comment and surrounding blanks).
std::string_view tqlGetRawParams(tqlHandle keyword);
/// Likewise a parameter and those behind it.
std::string_view tqlGetRawParamsFrom(tqlHandle param);
/// Likewise a single parameter.
std::string_view tqlGetRawParam(tqlHandle param);

// ---- building ----------------------------------------------------------------------------------
// A created structure is a growing text. Sections and targets open one another; keywords go into the section opened
// last; parameters to the keyword added last.

tqlHandle tqlCreate();
/// Makes room for a text of that length: one of many megabytes need not move as it grows.
void tqlReserve(tqlHandle structure, std::size_t length);
void tqlAddTarget(tqlHandle structure, std::string_view name);
void tqlAddSection(tqlHandle structure, std::string_view name);
/// Closes the section (or target) opened last.
void tqlEndSection(tqlHandle structure);
void tqlAddKeyword(tqlHandle structure, std::string_view name);
void tqlAddInt(tqlHandle structure, std::int32_t value);
void tqlAddDouble(tqlHandle structure, double value);
void tqlAddBool(tqlHandle structure, bool value);
/// UTF-8; bytes that are no UTF-8 are written as U+FFFD.
void tqlAddString(tqlHandle structure, std::string_view value);
void tqlAddFilename(tqlHandle structure, std::string_view value);

using TqlIn = std::variant<std::int32_t, double, bool, std::string_view>;
/// A keyword with one parameter.
void tqlPutParam(tqlHandle structure, std::string_view name, const TqlIn& value);
void tqlPutParamFilename(tqlHandle structure, std::string_view name, std::string_view value);
/// A keyword whose parameters follow the signature; false, and nothing added, when they do not fit it.
bool tqlPutListParam(tqlHandle structure, std::string_view name, std::string_view signature,
                     const std::vector<TqlIn>& values);

/// A keyword with parameters already in file notation (as tqlGetRawParams gave them).
void tqlAddRawKeyword(tqlHandle structure, std::string_view name, std::string_view params);
/// Likewise parameters behind those of the keyword added last.
void tqlAddRawParams(tqlHandle structure, std::string_view params);

/// The text built so far. Valid until the next operation on the structure. Empty while a section is still open, and
/// when something was asked that no file can hold: a name with other characters than names have (docs/format.md), a
/// parameter without a keyword, a keyword outside a section, raw parameters that are none, nesting deeper than 128.
std::string_view tqlGetText(tqlHandle structure);
/// Appends that text to a file; false, with the global error set, when any write, flush or close fails.
bool tqlAppend(tqlHandle structure, const std::string& path);
