// The view of an editor with tables beside a picture: what is typed in them is stored or refused before anything else
// happens, their lines come and go by the view's commands, and undo shows what it does.
#pragma once

#include "grid/gen_grid.h"
#include "grid/grid_host.h"
#include "grid/grid_search.h"
#include "ks/fc/project_view.h"

class QLabel;
class QSplitter;

class CTablesView : public CKsProjectView, public IGridHost
{
    Q_OBJECT
public:
    explicit CTablesView(QWidget* parent = nullptr) : CKsProjectView(parent) {}
    ~CTablesView() override;

    void OnInitialUpdate() override;
    void OnUpdate(CView* sender, int hint, CHint* object) override;
    bool MayLeave(KsLeave what) override;
    bool OnCommand(int id) override;
    bool IsCommandEnabled(int id) const override;

    // IGridHost
    bool LeaveField() override { return MayLeave(KsLeave::Field); }
    void LineEdited(CGenGrid& grid) override;
    void CellCurrent(CGenGrid& grid) override;
    void Run(CGenGrid& grid, GridAction action) override;
    bool CanSearch(const CGenGrid& grid) const override { return &grid == SearchedTable(); }

protected:
    /// A table with its title, below those that are there; its columns are still to come.
    CGenGrid* AddTable(QSplitter& side, QLabel*& title, const char* name);
    /// The table that had the focus last: commands are about its lines.
    CGenGrid& Lines() const { return *m_lines; }
    bool IsEditing() const;
    bool HasFocus(const CGenGrid& table) const;
    /// The document, the units or the language are other ones: everything is shown as it is now.
    virtual void ShowDocument() = 0;
    /// The one whose lines have a branch and a chainage.
    virtual const CGenGrid* SearchedTable() const = 0;
    /// By the view's command or by the keys of a table.
    virtual void InsertLine();

    CString PlaceText() const override { return m_lines ? m_lines->LineText() : CString(); }
    void changeEvent(QEvent* event) override;
    virtual void Retranslate() = 0;

private:
    void CommandsChanged();

    std::vector<CGenGrid*> m_tables;
    CGenGrid* m_lines = nullptr;
    CGridSearch m_search;
};
