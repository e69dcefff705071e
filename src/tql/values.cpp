// Values of parameters. The text was checked when it was loaded, so a value of the right type cannot fail.
#include "tql/node.h"
#include "tql/number.h"
#include "tql/scan.h"

using namespace tql;

namespace {

tqlHandle ParamOf(tqlHandle section, std::string_view name, int keyword, int param)
{
    return tqlParamByNum(tqlKeywordByNameNum(section, name, keyword), param);
}

// Which types a letter of a signature takes.
bool Fits(char letter, TqlType type)
{
    constexpr std::string_view letters[] = {"", "id", "d", "b", "s", "n"}; // by type
    return letters[std::size_t(type)].find(letter) != std::string_view::npos;
}

bool Fits(char letter, const TqlOut& out)
{
    constexpr std::string_view letters[] = {"i", "d", "b", "sn"}; // by alternative
    return letters[out.index()].find(letter) != std::string_view::npos &&
           std::visit([](const auto* pointer) { return pointer != nullptr; }, out);
}

} // namespace

TqlType tqlGetType(tqlHandle param)
{
    const char* const p = AsParam(param);
    return p ? ParamType(p) : TqlType::None;
}

// Each looks at the parameter, stores its value when it is of the type, and leaves `end` behind what it looked at.
namespace {

bool ReadValue(const char* p, std::int32_t* value, const char*& end)
{
    if (!p || ParamType(p) != TqlType::Int)
        return false;
    end = ReadInt(p, *value);
    return true;
}

bool ReadValue(const char* p, double* value, const char*& end)
{
    if (!p || !StartsNumber(*p))
        return false;
    end = ReadDouble(p, *value);
    return true;
}

bool ReadValue(const char* p, bool* value, const char*& end)
{
    if (!p || (*p != 't' && *p != 'f'))
        return false;
    *value = *p == 't';
    end = SkipParam(p);
    return true;
}

bool ReadValue(const char* p, std::string* value, const char*& end)
{
    if (!p || (*p != '"' && *p != '<'))
        return false;
    end = UnescapeParam(p, *value);
    return true;
}

template <typename Value>
bool Get(tqlHandle param, Value* value)
{
    const char* end;
    return ReadValue(AsParam(param), value, end);
}

} // namespace

bool tqlGetInt(tqlHandle param, std::int32_t* value)
{
    return Get(param, value);
}
bool tqlGetDouble(tqlHandle param, double* value)
{
    return Get(param, value);
}
bool tqlGetBool(tqlHandle param, bool* value)
{
    return Get(param, value);
}
bool tqlGetString(tqlHandle param, std::string* value)
{
    return Get(param, value);
}

template <typename Value>
bool tqlTake(tqlHandle* param, Value* value)
{
    const char* const p = AsParam(*param);
    const char* end = nullptr;
    const bool stored = ReadValue(p, value, end);
    *param = stored ? HandleOf(ParamBehind(end)) : tqlNextParam(*param);
    return stored;
}
template bool tqlTake(tqlHandle*, std::int32_t*);
template bool tqlTake(tqlHandle*, double*);
template bool tqlTake(tqlHandle*, bool*);
template bool tqlTake(tqlHandle*, std::string*);

bool tqlGetParam(tqlHandle section, std::string_view name, TqlOut value, int keyword, int param)
{
    return std::visit([handle = ParamOf(section, name, keyword, param)](auto* out) { return Get(handle, out); }, value);
}

bool tqlGetParamFilename(tqlHandle section, std::string_view name, std::string* value, int keyword, int param)
{
    const tqlHandle handle = ParamOf(section, name, keyword, param);
    return tqlGetType(handle) == TqlType::FileName && tqlGetString(handle, value);
}

bool tqlGetListParam(tqlHandle section, std::string_view name, int number, std::string_view signature,
                     const std::vector<TqlOut>& out)
{
    const tqlHandle first = ParamOf(section, name, number, 1);
    if (out.size() != signature.size())
        return false;
    tqlHandle param = first;
    for (std::size_t i = 0; i < out.size(); ++i, param = tqlNextParam(param))
        if (!Fits(signature[i], tqlGetType(param)) || !Fits(signature[i], out[i]))
            return false;
    param = first;
    for (const TqlOut& pointer : out)
        std::visit([&](auto* value) { tqlTake(&param, value); }, pointer);
    return true;
}
