// Handles that close themselves, for tests.
#pragma once

#include "tql/tql.h"

#include <string>
#include <utility>

class Structure
{
public:
    explicit Structure(tqlHandle handle) : m_handle(handle) {}
    Structure(const Structure&) = delete;
    Structure& operator=(const Structure&) = delete;
    ~Structure() { tqlClose(&m_handle); }
    operator tqlHandle() const { return m_handle; }

private:
    tqlHandle m_handle;
};

inline Structure LoadText(std::string text)
{
    return Structure(tqlLoadText(std::move(text), "river.hdkv"));
}

/// The parameters given, as those of keyword "K" in target "T"; null when they are refused.
class Params
{
public:
    explicit Params(const std::string& params) : m_structure(LoadText("[T]\nK = " + params + "\n[/T]\n")) {}
    tqlHandle Target() const { return tqlTargetByNameNum(m_structure, "T", 1); }
    tqlHandle Keyword() const { return tqlKeywordByNameNum(Target(), "K", 1); }
    tqlHandle operator[](int number) const { return tqlParamByNum(Keyword(), number); }

private:
    Structure m_structure;
};
