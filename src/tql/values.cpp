// Values of parameters. The text was checked when it was loaded, so a value of the right type cannot fail.
#include "tql/node.h"
#include "tql/number.h"
#include "tql/scan.h"

using namespace tql;

namespace {

// The parameter's text when it is of that type.
const char* ParamOf(tqlHandle param, TqlType type)
{
    const char* const p = AsParam(param);
    return p && ParamType(p) == type ? p : nullptr;
}

tqlHandle ParamOf(tqlHandle section, std::string_view name, int keyword, int param)
{
    return tqlParamByNum(tqlKeywordByNameNum(section, name, keyword), param);
}

// One letter of a signature: which types it takes, and storing one.
bool Fits(char letter, TqlType type)
{
    switch (letter) {
    case 'i':
        return type == TqlType::Int;
    case 'd':
        return type == TqlType::Double || type == TqlType::Int;
    case 'b':
        return type == TqlType::Bool;
    case 's':
        return type == TqlType::String;
    case 'n':
        return type == TqlType::FileName;
    default:
        return false;
    }
}

bool Fits(char letter, const TqlOut& out)
{
    constexpr std::string_view letters[] = {"i", "d", "b", "sn"}; // by alternative
    return letters[out.index()].find(letter) != std::string_view::npos &&
           std::visit([](const auto* pointer) { return pointer != nullptr; }, out);
}

struct Store
{
    tqlHandle param;
    void operator()(std::int32_t* value) const { tqlGetInt(param, value); }
    void operator()(double* value) const { tqlGetDouble(param, value); }
    void operator()(bool* value) const { tqlGetBool(param, value); }
    void operator()(std::string* value) const { tqlGetString(param, value); }
};

} // namespace

TqlType tqlGetType(tqlHandle param)
{
    const char* const p = AsParam(param);
    return p ? ParamType(p) : TqlType::None;
}

bool tqlGetInt(tqlHandle param, std::int32_t* value)
{
    const char* const p = ParamOf(param, TqlType::Int);
    if (p)
        *value = IntValue(p);
    return p != nullptr;
}

bool tqlGetDouble(tqlHandle param, double* value)
{
    const char* const p = AsParam(param);
    if (!p || !Fits('d', ParamType(p)))
        return false;
    *value = DoubleValue(p);
    return true;
}

bool tqlGetBool(tqlHandle param, bool* value)
{
    const char* const p = ParamOf(param, TqlType::Bool);
    if (p)
        *value = *p == 't';
    return p != nullptr;
}

bool tqlGetString(tqlHandle param, std::string* value)
{
    const char* const p = AsParam(param);
    if (!p || (*p != '"' && *p != '<'))
        return false;
    UnescapeParam(p, *value);
    return true;
}

bool tqlGetParam(tqlHandle section, std::string_view name, bool* value, int keyword, int param)
{
    return tqlGetBool(ParamOf(section, name, keyword, param), value);
}

bool tqlGetParam(tqlHandle section, std::string_view name, std::int32_t* value, int keyword, int param)
{
    return tqlGetInt(ParamOf(section, name, keyword, param), value);
}

bool tqlGetParam(tqlHandle section, std::string_view name, double* value, int keyword, int param)
{
    return tqlGetDouble(ParamOf(section, name, keyword, param), value);
}

bool tqlGetParam(tqlHandle section, std::string_view name, std::string* value, int keyword, int param)
{
    return tqlGetString(ParamOf(section, name, keyword, param), value);
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
    for (const TqlOut& pointer : out) {
        std::visit(Store{param}, pointer);
        param = tqlNextParam(param);
    }
    return true;
}
