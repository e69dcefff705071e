// What has become of a document since it was saved or read, as far as it tells what a line held then.
#pragma once

#include "ks/ks_export.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <vector>

/// What is known of a line at the last save.
enum class KsLineOrigin
{
    Saved,  // it was there
    New,    // it was not
    Unknown // it may have been any, or none
};

/// A line of a list or table on its way back to what it was at the last save.
struct KsTracedLine
{
    const void* data;                  // the list or table
    std::size_t place;                 // there, from 0, without fixed rows
    std::optional<std::uintptr_t> key; // names it for as long as it exists; nothing where its place does
    // Of a table that belongs to a line of a list:
    const void* list = nullptr;
    std::size_t placeInList = 0;
    bool isNamedByPlace = false; // the table moves in memory, so that `data` does not name it
    /// What the line held then, in an object of its own: made when it is asked for the first time.
    std::function<void*()> object = {};
    KsLineOrigin origin = KsLineOrigin::Saved;
};

/// What a step did to lines.
class KS_API KsLineChange
{
public:
    virtual ~KsLineChange();
    /// The line is what it was before the step was made or, unless `forward`, taken back.
    virtual void TakeBack(KsTracedLine& line, bool forward) const = 0;
};

/// Everything has become something else: nobody knows which line was which.
class KS_API KsEveryLineReplaced : public KsLineChange
{
public:
    void TakeBack(KsTracedLine& line, bool forward) const override;
};

/// The steps on lines from the saved state to the present one, be they made or taken back. They share with the steps
/// themselves what those know, and stay when those are gone: who undoes what was saved, and goes on otherwise, has no
/// such steps any more.
class KS_API CKsUnsavedChanges
{
public:
    CKsUnsavedChanges() = default;
    CKsUnsavedChanges(const CKsUnsavedChanges&) = delete;
    CKsUnsavedChanges& operator=(const CKsUnsavedChanges&) = delete;

    /// Asks for the memory that the next Add needs.
    void MakeRoom();
    /// A step was made, or taken back. Null is for one that concerns no line.
    void Add(std::shared_ptr<const KsLineChange> change, bool forward);
    /// The document is what its file holds.
    void Clear();

    bool IsEmpty() const { return m_steps.empty(); }
    /// Another one with every change of a line, and when it is forgotten.
    int Version() const { return m_version; }
    void TakeBack(KsTracedLine& line) const;

private:
    struct Step
    {
        std::shared_ptr<const KsLineChange> change;
        bool forward;
    };
    std::vector<Step> m_steps;
    int m_version = 0;
};
