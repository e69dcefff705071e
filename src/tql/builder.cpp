// Created structures: a growing text.
#include "tql/char_class.h"
#include "tql/node.h"
#include "tql/number.h"
#include "tql/parser.h"
#include "tql/scan.h"

#include <filesystem>
#include <fstream>

using namespace tql;

namespace {

struct Builder
{
    Kind kind = Kind::Builder;
    bool valid = true;     // nothing was asked that no file can hold
    bool inLine = false;   // a keyword's line is open
    bool anyParam = false; // it has a parameter
    std::string text = std::string(FirstLine) + '\n';
    struct Name // where it stands in `text`
    {
        std::size_t first, length;
    };
    std::vector<Name> open;

    void EndLine();
    void Indent() { text.append(2 * open.size(), ' '); }
    /// Room for the next parameter; false when no keyword was added.
    bool BeginParam();
    void Open(std::string_view name);
    void Close();
    void BeginKeyword(std::string_view name);
};

void Builder::EndLine()
{
    if (inLine)
        text += '\n';
    inLine = false;
}

bool Builder::BeginParam()
{
    if (!inLine) {
        valid = false;
        return false;
    }
    text.append(anyParam ? ", " : " ", anyParam ? 2 : 1);
    anyParam = true;
    return true;
}

void Builder::Open(std::string_view name)
{
    EndLine();
    valid = valid && IsName(name) && open.size() < MaxDepth;
    Indent();
    text += '[';
    open.push_back({text.size(), name.size()});
    text += name;
    text += "]\n";
}

void Builder::Close()
{
    EndLine();
    if (open.empty()) {
        valid = false;
        return;
    }
    const Name name = open.back();
    open.pop_back();
    Indent();
    text += "[/";
    text.append(text, name.first, name.length);
    text += "]\n";
}

void Builder::BeginKeyword(std::string_view name)
{
    EndLine();
    valid = valid && IsName(name) && !open.empty();
    Indent();
    text += name;
    text += " =";
    inLine = true;
    anyParam = false;
}

Builder* AsBuilder(tqlHandle handle)
{
    return handle && KindOf(handle) == Kind::Builder ? reinterpret_cast<Builder*>(handle) : nullptr;
}

template <typename Value>
void AddParam(tqlHandle structure, void (*append)(std::string&, Value), Value value)
{
    Builder* const builder = AsBuilder(structure);
    if (builder && builder->BeginParam())
        append(builder->text, value);
}

// Whether a value of that alternative goes by that letter.
bool Fits(char letter, const TqlIn& value)
{
    constexpr std::string_view letters[] = {"id", "d", "b", "sn"}; // an integer may stand for a float
    return letters[value.index()].find(letter) != std::string_view::npos;
}

template <typename... Functions>
struct Overloads : Functions...
{
    using Functions::operator()...;
};
template <typename... Functions>
Overloads(Functions...) -> Overloads<Functions...>;

void AddParam(tqlHandle structure, const TqlIn& value)
{
    std::visit(Overloads{[&](std::int32_t integer) { tqlAddInt(structure, integer); },
                         [&](double number) { tqlAddDouble(structure, number); },
                         [&](bool flag) { tqlAddBool(structure, flag); },
                         [&](std::string_view text) { tqlAddString(structure, text); }},
               value);
}

} // namespace

tqlHandle tqlCreate()
{
    return HandleOf(new Builder);
}

void tqlReserve(tqlHandle structure, std::size_t length)
{
    if (Builder* const builder = AsBuilder(structure))
        builder->text.reserve(length);
}

void tqlClose(tqlHandle* structure)
{
    if (!structure)
        return;
    if (Builder* const builder = AsBuilder(*structure))
        delete builder;
    else
        delete AsStructure(*structure);
    *structure = nullptr;
}

void tqlAddTarget(tqlHandle structure, std::string_view name)
{
    if (Builder* const builder = AsBuilder(structure)) {
        builder->valid = builder->valid && builder->open.empty(); // a target is a top-level section
        builder->Open(name);
    }
}

void tqlAddSection(tqlHandle structure, std::string_view name)
{
    if (Builder* const builder = AsBuilder(structure)) {
        builder->valid = builder->valid && !builder->open.empty();
        builder->Open(name);
    }
}

void tqlEndSection(tqlHandle structure)
{
    if (Builder* const builder = AsBuilder(structure))
        builder->Close();
}

void tqlAddKeyword(tqlHandle structure, std::string_view name)
{
    if (Builder* const builder = AsBuilder(structure))
        builder->BeginKeyword(name);
}

void tqlAddInt(tqlHandle structure, std::int32_t value)
{
    AddParam(structure, AppendInt, value);
}

void tqlAddDouble(tqlHandle structure, double value)
{
    AddParam(structure, AppendDouble, value);
}

void tqlAddBool(tqlHandle structure, bool value)
{
    AddParam<std::string_view>(
        structure, [](std::string& out, std::string_view word) { out += word; }, value ? "true" : "false");
}

void tqlAddString(tqlHandle structure, std::string_view value)
{
    AddParam(structure, AppendString, value);
}

void tqlAddFilename(tqlHandle structure, std::string_view value)
{
    AddParam(structure, AppendFilename, value);
}

void tqlPutParam(tqlHandle structure, std::string_view name, const TqlIn& value)
{
    tqlAddKeyword(structure, name);
    AddParam(structure, value);
}

void tqlPutParamFilename(tqlHandle structure, std::string_view name, std::string_view value)
{
    tqlAddKeyword(structure, name);
    tqlAddFilename(structure, value);
}

bool tqlPutListParam(tqlHandle structure, std::string_view name, std::string_view signature,
                     const std::vector<TqlIn>& values)
{
    if (!AsBuilder(structure) || signature.size() != values.size())
        return false;
    for (std::size_t i = 0; i < values.size(); ++i)
        if (!Fits(signature[i], values[i]))
            return false;
    tqlAddKeyword(structure, name);
    for (std::size_t i = 0; i < values.size(); ++i) {
        if (signature[i] == 'n')
            tqlAddFilename(structure, std::get<std::string_view>(values[i]));
        else
            AddParam(structure, values[i]);
    }
    return true;
}

void tqlAddRawKeyword(tqlHandle structure, std::string_view name, std::string_view params)
{
    tqlAddKeyword(structure, name);
    tqlAddRawParams(structure, params);
}

void tqlAddRawParams(tqlHandle structure, std::string_view params)
{
    Builder* const builder = AsBuilder(structure);
    if (!builder)
        return;
    builder->valid = builder->valid && IsParamList(params);
    if (builder->valid && !params.empty() && builder->BeginParam())
        builder->text += params;
}

std::string_view tqlGetText(tqlHandle structure)
{
    Builder* const builder = AsBuilder(structure);
    if (!builder || !builder->valid || !builder->open.empty())
        return {};
    return builder->text;
}

bool tqlAppend(tqlHandle structure, const std::string& path)
{
    const std::string_view text = tqlGetText(structure);
    bool good = !text.empty();
    if (good) {
        std::ofstream out(std::filesystem::u8path(path), std::ios::binary | std::ios::app);
        out.write(text.data(), std::streamsize(text.size()));
        out.flush();
        out.close();
        good = out.good();
    }
    SetGlobalError(good ? TqlError::None : TqlError::Write);
    return good;
}
