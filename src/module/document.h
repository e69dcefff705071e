// The document of the editor: one HD parameter file.
#pragma once

#include "data/hd_parameters.h"
#include "ks/fc/doc.h"
#include "ks/fc/package.h"
#include "module/document_file.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <unordered_set>
#include <vector>

class CPurgedLines;
class IRowSource;

class CKavo0_hdDoc : public CKsDoc
{
    Q_OBJECT
public:
    CKavo0_hdDoc();

    HD_Parameters& Parameters() { return m_parameters; }
    const HD_Parameters& Parameters() const { return m_parameters; }

    BOOL OnNewDocument() override;
    /// Whether a path has an extension of these files: ".HDKV" or ".hdkv".
    static bool HasExtension(const CString& path);
    /// Accepts these extensions. A file that cannot be parsed opens with what the records hold, after a message.
    BOOL OnOpenDocument(const CString& path) override;
    /// Saves to the path with the extension ".HDKV"; see docs/architecture.md, "Saving".
    BOOL OnSaveDocument(const CString& path) override;
    CString SavePathFor(const CString& path) const override;
    void DeleteContents() override;

    /// Joins the shell's project; true when the document belongs to one.
    BOOL GetProjectInfo(CView* view, const CString& name);
    void LeaveProject(CView* view, const CString& name);
    /// Tells the other editors of the project that data changed. Every step on the undo stack, forth or back, is told
    /// by itself, once, when the event that it belongs to is over.
    void DataChange(const CString& name);
    /// Tells at once what waits to be told.
    void TellChanges();
    /// Marks the document modified, updates all views but the sender, and gives the sender the focus back.
    void UpdateAll(CView* sender, int hint, CHint* object);

    /// Gives an empty list the one line that its page shows. The line is no change of the document: neither the
    /// modified flag nor undo sees it, and a save removes it again while it is untouched.
    void AddPlaceholder(CGenList& list, std::unique_ptr<HD_RiverPos> record);
    void RemovePlaceholders();
    /// Takes the placeholder out of a list that holds nothing else.
    void RemovePlaceholder(CGenList& list);
    bool IsPlaceholder(const HD_RiverPos& record) const { return m_placeholders.contains(&record); }
    /// Whatever edits or removes a record says so: a placeholder becomes an ordinary line.
    void PlaceholderTouched(const HD_RiverPos& record) { m_placeholders.erase(&record); }

    // Likewise for a list without locations, named by its address.
    void AddPlaceholderRow(const void* rows) { m_placeholderRows.insert(rows); }
    bool IsPlaceholderRow(const void* rows) const { return m_placeholderRows.contains(rows); }
    void PlaceholderRowTouched(const void* rows) { m_placeholderRows.erase(rows); }

    /// From now on a save leaves out the rows that are incomplete, as one step to undo. For lists without locations:
    /// a page says so when it shows one, and tells the user on the page.
    void CleanAtSave(std::shared_ptr<IRowSource> rows, std::function<bool(const void* row)> isIncomplete);
    struct CCleanedRows
    {
        std::shared_ptr<IRowSource> rows;
        std::function<bool(const void* row)> isIncomplete;
    };
    const std::vector<CCleanedRows>& CleanedRows() const { return m_cleanedRows; }

    /// Sends a request to the shell's switchboard; its answer, 0 outside a project. What the other editors have to say
    /// is appended to `objects`, which stays the caller's.
    LRESULT AskShell(WPARAM request, CView* view, CObList* objects = nullptr);
    /// Tells the other editors of the project something (KsRequest); nothing outside a project.
    void TellShell(WPARAM news, CView* view, CObList* objects);

    std::intptr_t ProjectHandle() const { return m_hProject; }
    /// The file last opened or saved.
    const CDocumentFile& File() const { return m_file; }
    /// It could not be parsed, and nobody has asked to edit what is shown instead.
    bool IsReadOnly() const { return m_isReadOnly; }
    void EditUnreadable();

signals:
    /// Undo or redo changed a list (or a global value: null list); the view brings its page forward.
    void Reveal(CGenList* list, int row, int column);

    /// What is known of File(), or IsReadOnly(), is another.
    void FileStateChanged();
    /// What was done, for the status bar.
    void Said(const QString& text);

private:
    void StepMade();
    /// Whether `target`, an existing file that this document was not read from, may be replaced.
    bool MayReplace(const CString& target, const CString& path);
    LRESULT SendToShell(unsigned message, WPARAM request, CView* view, const CString& name, CObList* objects = nullptr);

    HD_Parameters m_parameters;
    CDocumentFile m_file;
    std::intptr_t m_hProject = 0;
    int m_untold = 0; // steps that the project has not heard of
    bool m_isReadOnly = false;
    std::unordered_set<const HD_RiverPos*> m_placeholders;
    std::unordered_set<const void*> m_placeholderRows;
    std::vector<CCleanedRows> m_cleanedRows;
};

/// Update hints of the document.
namespace Hint {
inline constexpr int Store = 1;  // views move the values being edited into the records
inline constexpr int Reload = 2; // views show the records again
} // namespace Hint
