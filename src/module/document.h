// The document of the editor: one HD parameter file.
#pragma once

#include "data/hd_parameters.h"
#include "ks/fc/doc.h"

#include <cstdint>

class CKavo0_hdDoc : public CKsDoc
{
    Q_OBJECT
public:
    CKavo0_hdDoc();

    HD_Parameters& Parameters() { return m_parameters; }
    const HD_Parameters& Parameters() const { return m_parameters; }

    BOOL OnNewDocument() override;
    /// Accepts ".HDKV" and ".hdkv". A file that cannot be parsed opens with what the records hold, after a message.
    BOOL OnOpenDocument(const CString& path) override;
    /// Saves to the path with the extension ".HDKV"; see docs/architecture.md, "Saving".
    BOOL OnSaveDocument(const CString& path) override;
    void DeleteContents() override;

    /// Joins the shell's project; true when the document belongs to one.
    BOOL GetProjectInfo(CView* view, const CString& name);
    void LeaveProject(CView* view, const CString& name);
    /// Tells the other editors of the project that data changed.
    void DataChange(const CString& name);
    /// Marks the document modified, updates all views but the sender, and gives the sender the focus back.
    void UpdateAll(CView* sender, int hint, CHint* object);

    std::intptr_t ProjectHandle() const { return m_hProject; }
    const CString& FilePath() const { return m_strFilePath; }

signals:
    /// Undo or redo changed a list (or a global value: null list); the view brings its page forward.
    void Reveal(CGenList* list, int row, int column);

private:
    void ReadData(const CString& path);
    bool WriteData(const CString& path);

    HD_Parameters m_parameters;
    CString m_strFilePath;      // of the file last opened
    std::intptr_t m_hProject = 0;
    bool m_unreadable = false;  // the file at m_strFilePath could not be parsed
};

/// Update hints of the document.
namespace Hint {
inline constexpr int Store = 1;  // views move the values being edited into the records
inline constexpr int Reload = 2; // views show the records again
} // namespace Hint
