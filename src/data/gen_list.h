// Owning lists of location records: in order, with records that stay where they are in memory, and access by position
// in constant time.
#pragma once

#include "data/river_pos.h"
#include "files/finding.h"
#include "files/unknown_content.h"

#include <cstddef>
#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

class CGenList
{
public:
    /// A position past the last record.
    static constexpr std::size_t End = std::size_t(-1);

    CGenList() = default;
    CGenList(const CGenList&) = delete;
    CGenList& operator=(const CGenList&) = delete;
    CGenList(CGenList&&) = default;
    CGenList& operator=(CGenList&&) = default;
    virtual ~CGenList() = default;

    /// Deletes every record.
    virtual void RemoveAll();
    /// A new record of the list's family with its defaults, not in the list. Null for the bare base list.
    virtual std::unique_ptr<HD_RiverPos> NewRecord() const { return nullptr; }
    /// A record that holds what this one of the list's family does, not in the list. Null likewise.
    virtual std::unique_ptr<HD_RiverPos> CopyOf(const HD_RiverPos& /*record*/) const { return nullptr; }
    /// The fields of the list's family after name and chainage.
    virtual FieldList Fields() const { return {}; }

    std::size_t GetCount() const { return m_records.size(); }
    bool IsEmpty() const { return m_records.empty(); }
    HD_RiverPos& GetAt(std::size_t index) { return *m_records[index]; }
    const HD_RiverPos& GetAt(std::size_t index) const { return *m_records[index]; }
    HD_RiverPos& AddTail(std::unique_ptr<HD_RiverPos> record);
    /// `index` up to GetCount(); the records must be of the list's family.
    void InsertAt(std::size_t index, std::unique_ptr<HD_RiverPos> record);
    void InsertAt(std::size_t index, std::vector<std::unique_ptr<HD_RiverPos>> records);
    std::unique_ptr<HD_RiverPos> RemoveAt(std::size_t index);
    std::vector<std::unique_ptr<HD_RiverPos>> RemoveAt(std::size_t index, std::size_t count);
    void Reserve(std::size_t count) { m_records.reserve(count); }
    /// All records against others of the list's family.
    void Swap(std::vector<std::unique_ptr<HD_RiverPos>>& records) noexcept { m_records.swap(records); }

    /// Removes and deletes every blank record, head to tail. Unless `asked` is set, `ask` is called at the first one;
    /// its answer false stops with false (nothing more is removed), true sets `asked`. Without `ask` nobody can agree,
    /// which counts as false.
    bool RemoveIncompleteLines(bool& asked, const std::function<bool()>& ask = {});

    /// First record at or after `position` whose chainage equals the value exactly; `position` is left after it (End
    /// when there is none). Null when there is none.
    HD_RiverPos* FindByChainage(double chainage, std::size_t& position);
    /// Likewise the first record whose name begins with the text.
    HD_RiverPos* FindByName(std::string_view text, std::size_t& position);

private:
    template <typename Fits>
    HD_RiverPos* Find(std::size_t& position, Fits fits);

    std::vector<std::unique_ptr<HD_RiverPos>> m_records;
};

class CGenParamListBase;

/// A section of a file that holds records: a list of them, or, as sub-sections, a list of such lists.
class CListSection
{
public:
    virtual ~CListSection() = default;
    /// Appends what occurrence `number` of the section holds; a missing one leaves everything as it is.
    virtual void Load(tqlHandle parent, int number, LoadReport* report = nullptr) = 0;
    /// Writes the section; of sub-sections those that are worth it, or `everySet`.
    virtual void Save(tqlHandle structure, bool everySet = false) const = 0;
    /// Removes the records and what else the section held.
    virtual void Empty() = 0;

    virtual const std::string& SectionName() const = 0;
    virtual bool HasSets() const = 0; // it is a list of lists
    virtual std::size_t ListCount() const = 0;
    virtual FieldList RecordFields() const = 0; // after name and chainage
    virtual const CGenParamListBase& ListAt(std::size_t index) const = 0;
    CGenParamListBase& ListAt(std::size_t index)
    {
        return const_cast<CGenParamListBase&>(std::as_const(*this).ListAt(index));
    }

protected:
    CListSection() = default;
    CListSection(CListSection&&) = default;
    CListSection& operator=(CListSection&&) = default;
};

/// A list that is stored as one section of keywords "DATA".
class CGenParamListBase : public CGenList, public CListSection
{
public:
    explicit CGenParamListBase(std::string sectionName) : m_sectionName(std::move(sectionName)) {}
    const std::string& SectionName() const override { return m_sectionName; }

    /// Writes the section with every record, blank ones too.
    void Save(tqlHandle structure, bool everySet = false) const override;
    void Load(tqlHandle parent, int number, LoadReport* report = nullptr) override;
    void Empty() override
    {
        RemoveAll();
        m_unknown.clear();
    }
    bool HasSets() const override { return false; }
    std::size_t ListCount() const override { return 1; }
    FieldList RecordFields() const override { return Fields(); }
    using CListSection::ListAt;
    const CGenParamListBase& ListAt(std::size_t) const override { return *this; }

    /// What the section held beside its records. It stays when the records are removed.
    const UnknownNodes& Unknown() const { return m_unknown; }

private:
    std::string m_sectionName;
    UnknownNodes m_unknown;
};

template <typename T>
class CGenParamList final : public CGenParamListBase
{
public:
    using Record = T;
    using CGenParamListBase::CGenParamListBase;

    std::unique_ptr<HD_RiverPos> NewRecord() const override { return std::make_unique<T>(); }
    std::unique_ptr<HD_RiverPos> CopyOf(const HD_RiverPos& record) const override
    {
        return std::make_unique<T>(static_cast<const T&>(record));
    }
    FieldList Fields() const override { return T::DeclaredFields(); }
    T& GetAt(std::size_t index) { return static_cast<T&>(CGenList::GetAt(index)); }
    const T& GetAt(std::size_t index) const { return static_cast<const T&>(CGenList::GetAt(index)); }
    T& Add(T record = {}) { return static_cast<T&>(AddTail(std::make_unique<T>(std::move(record)))); }
};

/// An owning list of lists, stored as one section of sub-sections.
template <typename T>
class CGenMetaList final : public CListSection
{
public:
    CGenMetaList(std::string outerSection, std::string innerSection)
        : m_outerSection(std::move(outerSection)), m_innerSection(std::move(innerSection))
    {
    }

    const std::string& SectionName() const override { return m_outerSection; }
    const std::string& InnerSectionName() const { return m_innerSection; }
    std::size_t GetCount() const { return m_lists.size(); }
    bool IsEmpty() const { return m_lists.empty(); }
    CGenParamList<T>& GetAt(std::size_t index) { return *m_lists[index]; }
    const CGenParamList<T>& GetAt(std::size_t index) const { return *m_lists[index]; }
    /// A new empty list at the end.
    CGenParamList<T>& Add() { return *m_lists.emplace_back(std::make_unique<CGenParamList<T>>(m_innerSection)); }
    std::unique_ptr<CGenParamList<T>> RemoveAt(std::size_t index)
    {
        auto list = std::move(m_lists[index]);
        m_lists.erase(m_lists.begin() + std::ptrdiff_t(index));
        return list;
    }
    void InsertAt(std::size_t index, std::unique_ptr<CGenParamList<T>> list)
    {
        m_lists.insert(m_lists.begin() + std::ptrdiff_t(index), std::move(list));
    }
    void Empty() override
    {
        m_lists.clear();
        m_unknown.clear();
    }
    bool HasSets() const override { return true; }
    std::size_t ListCount() const override { return m_lists.size(); }
    FieldList RecordFields() const override { return T::DeclaredFields(); }
    using CListSection::ListAt;
    const CGenParamListBase& ListAt(std::size_t index) const override { return *m_lists[index]; }

    /// A sub-list is written only when one of its records from the second on is filled (or it holds unknown content).
    static bool IsWorthKeeping(const CGenParamList<T>& list)
    {
        for (std::size_t index = 1; index < list.GetCount(); ++index)
            if (!list.GetAt(index).IsBlank())
                return true;
        return !list.Unknown().empty();
    }

    void Save(tqlHandle structure, bool everySet = false) const override
    {
        tqlAddSection(structure, m_outerSection);
        for (const auto& list : m_lists)
            if (everySet || IsWorthKeeping(*list))
                list->Save(structure);
        WriteUnknown(structure, m_unknown);
        tqlEndSection(structure);
    }
    void Load(tqlHandle parent, int number = 1, LoadReport* report = nullptr) override
    {
        const tqlHandle outer = tqlSectionByNameNum(parent, m_outerSection, number);
        if (!outer)
            return;
        for (int inner = 1; tqlSectionByNameNum(outer, m_innerSection, inner); ++inner)
            Add().Load(outer, inner, report);
        const auto known = [this](std::string_view name, bool isSection) {
            return isSection && name == m_innerSection ? Known::Every : Known::No;
        };
        CollectUnknown(outer, known, m_unknown, report);
    }

private:
    std::string m_outerSection, m_innerSection;
    std::vector<std::unique_ptr<CGenParamList<T>>> m_lists;
    UnknownNodes m_unknown;
};
