// What a verb that can fail returns: its value, or why there is none.
#pragma once

#include <cstddef>
#include <string>
#include <system_error>
#include <utility>
#include <variant>

struct Error
{
    std::string message{}; // one sentence in English: what, where and why
    // What a program that speaks other languages needs to say it itself. Set when a file could not be read or written.
    std::error_code code{};
    std::string path{};
    bool reading = false;
    std::string kept{}; // the file that holds the new content, when there is no other any more
};

template <typename T>
class [[nodiscard]] Result
{
public:
    Result(T value) : m_content(std::in_place_index<0>, std::move(value)) {}
    Result(Error error) : m_content(std::in_place_index<1>, std::move(error)) {}

    explicit operator bool() const { return m_content.index() == 0; }
    /// Only when it succeeded.
    T& value() { return std::get<0>(m_content); }
    const T& value() const { return std::get<0>(m_content); }
    T& operator*() { return value(); }
    T* operator->() { return &value(); }
    /// Only when it failed.
    const Error& error() const { return std::get<1>(m_content); }

private:
    std::variant<T, Error> m_content;
};

template <>
class [[nodiscard]] Result<void>
{
public:
    Result() = default;
    Result(Error error) : m_error(std::move(error)), m_failed(true) {}

    explicit operator bool() const { return !m_failed; }
    const Error& error() const { return m_error; }

private:
    Error m_error;
    bool m_failed = false;
};
