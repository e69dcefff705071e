// Parameters that stand behind those a keyword declares, written by a newer version or another tool. They are read
// with their object and written back behind its own parameters, as they stood.
#pragma once

#include "tql/tql.h"

#include <memory>
#include <string>

/// One pointer wide, because every location record carries one and hardly any uses it.
class ExtraParams
{
public:
    ExtraParams() = default;
    ExtraParams(const ExtraParams& other)
        : m_text(other.m_text ? std::make_unique<std::string>(*other.m_text) : nullptr)
    {
    }
    ExtraParams(ExtraParams&&) noexcept = default;
    ExtraParams& operator=(ExtraParams other) noexcept
    {
        m_text = std::move(other.m_text);
        return *this;
    }

    bool IsEmpty() const { return !m_text; }
    /// Takes the parameter and all behind it in its keyword; null for none.
    void Read(tqlHandle first)
    {
        if (first || m_text)
            m_text = first ? std::make_unique<std::string>(tqlGetRawParamsFrom(first)) : nullptr;
    }
    /// Appends them to the keyword being written.
    void Write(tqlHandle structure) const
    {
        if (m_text)
            tqlAddRawParams(structure, *m_text);
    }

private:
    std::unique_ptr<std::string> m_text; // null when there are none
};
