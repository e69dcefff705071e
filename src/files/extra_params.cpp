#include "files/extra_params.h"

void ExtraParams::ReadFrom(tqlHandle first)
{
    Clear();
    if (!first)
        return;
    m_values = std::make_unique<Values>();
    for (tqlHandle param = first; param; param = tqlNextParam(param)) {
        Value& value = m_values->emplace_back(Value{tqlGetType(param), {}});
        switch (value.type) {
        case TqlType::Int:
            tqlGetInt(param, &value.value.emplace<std::int32_t>());
            break;
        case TqlType::Double:
            tqlGetDouble(param, &value.value.emplace<double>());
            break;
        case TqlType::Bool:
            tqlGetBool(param, &value.value.emplace<bool>());
            break;
        case TqlType::String:
        case TqlType::FileName:
            tqlGetString(param, &value.value.emplace<std::string>());
            break;
        case TqlType::None:
            break;
        }
    }
}

void ExtraParams::WriteAll(tqlHandle structure) const
{
    for (const Value& value : *m_values) {
        switch (value.type) {
        case TqlType::Int:
            tqlAddInt(structure, std::get<std::int32_t>(value.value));
            break;
        case TqlType::Double:
            tqlAddDouble(structure, std::get<double>(value.value));
            break;
        case TqlType::Bool:
            tqlAddBool(structure, std::get<bool>(value.value));
            break;
        case TqlType::String:
            tqlAddString(structure, std::get<std::string>(value.value));
            break;
        case TqlType::FileName:
            tqlAddFilename(structure, std::get<std::string>(value.value));
            break;
        case TqlType::None:
            break;
        }
    }
}
