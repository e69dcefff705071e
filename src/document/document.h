// The document of the editor: one HD parameter file.
#pragma once

#include "data/hd_parameters.h"
#include "ks/fc/doc.h"
#include "ks/fc/package.h"
#include "document/change_place.h"
#include "document/document_file.h"
#include "res/strings.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
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
    /// Accepts these extensions. A file that cannot be parsed opens with what the records hold, and says so (File()).
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

    /// What a save makes of a table without locations that the user has seen. A page says so whenever it shows one;
    /// what no page has shown is written as it is.
    struct ShownRows
    {
        std::shared_ptr<IRowSource> rows;
        /// These rows are left out, as one step to undo; the page tells the user beforehand. May be empty.
        std::function<bool(const void* row)> isIncomplete = {};
        Str oneDropped = {}, manyDropped = {}; // said after the save
        /// The row of defaults that the page shows of an empty table is written.
        bool writesFirstRow = false;
    };
    void AtSave(ShownRows shown);
    const std::vector<ShownRows>& RowsShown() const { return m_rowsShown; }

    /// A step that is being undone or redone shows here; told (Reveal) when the step is complete.
    void StepShows(const ChangePlace& place) { m_stepShows = place; }
    /// Tells the user in passing.
    void Say(const QString& text) { emit Said(text); }

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
    /// A step was undone or redone; the view brings what it changed into view.
    void Reveal(const ChangePlace& place);
    /// What was done, for the status bar.
    void Said(const QString& text);
    /// What is known of File(), or IsReadOnly(), is another.
    void FileStateChanged();

private:
    void StepMade(int index);
    void ShowStep(bool isUndo);
    void TellStep();
    bool WriteData(const CString& path);
    std::size_t UnwrittenSetups() const;
    /// Whether `target`, an existing file that this document was not read from, may be replaced.
    bool MayReplace(const CString& target, const CString& path);
    LRESULT SendToShell(unsigned message, WPARAM request, CView* view, const CString& name, CObList* objects = nullptr);

    HD_Parameters m_parameters;
    CDocumentFile m_file;
    std::intptr_t m_hProject = 0;
    int m_untold = 0; // steps that the project has not heard of
    bool m_isReadOnly = false;
    std::vector<ShownRows> m_rowsShown;
    std::optional<ChangePlace> m_stepShows;
    int m_steps = 0; // the undo stack's index, as last heard
};

/// Update hints of the document.
namespace Hint {
inline constexpr int Store = 1;  // views move the values being edited into the records
inline constexpr int Reload = 2; // views show the records again
} // namespace Hint
