// The document of the editor: one HD parameter file.
#pragma once

#include "data/hd_parameters.h"
#include "ks/fc/project_doc.h"
#include "res/strings.h"

#include <functional>
#include <memory>
#include <vector>

class CPurgedLines;
class IRowSource;

class CKavo0_hdDoc : public CKsProjectDoc
{
    Q_OBJECT
public:
    CKavo0_hdDoc();

    HD_Parameters& Parameters() { return m_parameters; }
    const HD_Parameters& Parameters() const { return m_parameters; }

    /// Whether a path has an extension of these files: ".HDKV" or ".hdkv".
    static bool HasExtension(const CString& path);
    /// Accepts these extensions. A file that cannot be parsed opens with what the records hold, and says so (File()).
    BOOL OnOpenDocument(const CString& path) override;
    /// Saves to the path with the extension ".HDKV"; see docs/architecture.md, "Saving".
    BOOL OnSaveDocument(const CString& path) override;
    /// The extension is always ".HDKV".
    CString SavePathFor(const CString& path) const override;
    void DeleteContents() override;
    Result<std::string> ContentText() const override;

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

protected:
    std::unique_ptr<QUndoCommand> MakeContentStep(tqlHandle structure, LoadReport& report,
                                                  const CString& text) override;

private:
    bool WriteData(const CString& path, CPurgedLines& purged);
    HD_Parameters NewContent() const;
    std::size_t UnwrittenSetups() const;
    /// Whether `target`, an existing file that this document was not read from, may be replaced.
    bool MayReplace(const CString& target, const CString& path);

    HD_Parameters m_parameters;
    std::vector<ShownRows> m_rowsShown;
};
