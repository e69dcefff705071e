// Parameters that stand behind those a keyword declares, written by a newer version or another tool. They are read
// with their object and written back behind its own parameters.
#pragma once

#include "tql/tql.h"

#include <memory>
#include <vector>

/// One pointer wide, because every location record carries one and hardly any uses it.
class ExtraParams
{
public:
    ExtraParams() = default;
    ExtraParams(const ExtraParams& other) : m_values(other.Copy()) {}
    ExtraParams(ExtraParams&&) noexcept = default;
    ExtraParams& operator=(const ExtraParams& other)
    {
        m_values = other.Copy();
        return *this;
    }
    ExtraParams& operator=(ExtraParams&&) noexcept = default;

    bool IsEmpty() const { return !m_values; }
    void Clear() { m_values.reset(); }
    /// Takes the parameter and all behind it in its keyword; null for none.
    void Read(tqlHandle first)
    {
        if (first || m_values)
            ReadFrom(first);
    }
    /// Appends them to the keyword being written.
    void Write(tqlHandle structure) const
    {
        if (m_values)
            WriteAll(structure);
    }

private:
    struct Value
    {
        TqlType type = TqlType::None;
        std::variant<std::int32_t, double, bool, std::string> value;
    };
    using Values = std::vector<Value>;

    std::unique_ptr<Values> Copy() const { return m_values ? std::make_unique<Values>(*m_values) : nullptr; }
    void ReadFrom(tqlHandle first);
    void WriteAll(tqlHandle structure) const;

    std::unique_ptr<Values> m_values; // null when there are none
};
