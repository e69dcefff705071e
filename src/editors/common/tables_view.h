// The view of an editor with two tables beside a picture: the lines of the document, and the parts of the one that is
// current. What is typed in them is stored or refused before anything else happens, their lines come and go by the
// view's commands, undo shows what it does, and other editors are answered.
#pragma once

#include "grid/gen_grid.h"
#include "grid/grid_commands.h"
#include "grid/grid_host.h"
#include "grid/grid_search.h"
#include "ks/fc/exchange.h"
#include "ks/fc/project_view.h"

#include <functional>

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
    std::vector<CKsMenuCommand> EditMenu() const override { return CGridCommands::ClipboardMenu(); }

    // IGridHost
    bool LeaveField() override { return MayLeave(KsLeave::Field); }
    void LineEdited(CGenGrid& grid) override;
    void CellCurrent(CGenGrid& grid) override;
    void LineCurrent(CGenGrid& grid) override;
    void Run(CGenGrid& grid, GridAction action) override;
    /// Its lines have a branch and a chainage.
    bool CanSearch(const CGenGrid& grid) const override { return &grid == m_main.grid; }

protected:
    /// A table as the user calls it.
    struct Table
    {
        CGenGrid* grid = nullptr;
        QLabel* title = nullptr;
    };
    /// Makes the content: the picture and the tables, whose columns are still to come. `widths` are in proportion.
    void MakeContent(QWidget& picture, int pictureWidth, int tablesWidth, const char* mainName, const char* partsName);
    /// Null before the first update.
    CGenGrid* MainTable() const { return m_main.grid; }
    CGenGrid* PartTable() const { return m_parts.grid; }
    QLabel& MainTitle() const { return *m_main.title; }
    /// The one whose parts are shown; -1 for none.
    int CurrentLine() const;
    /// The table that had the focus last: commands are about its lines.
    CGenGrid& Lines() const { return *m_lines; }
    const CGenGrid* LinesOrNull() const { return m_lines; } // before the first update
    bool IsEditing() const;
    bool HasFocus(const CGenGrid& table) const;
    /// By the view's command or by the keys of a table.
    virtual void InsertLine();

    /// Null for no line.
    virtual std::shared_ptr<IRowSource> MakePartRows(int line) = 0;
    virtual void ShowInPicture(int line) = 0;
    virtual QString PartTitle() const = 0;
    virtual void ShowParts();

    // What other editors ask.
    using Answer = std::function<LRESULT(CObList&)>;
    /// Null for a request that the editor does not know. An answer is 0 when there was nothing.
    virtual Answer AnswerTo(WPARAM request) = 0;
    virtual QStringList KnownBranches() const = 0;
    virtual void ShowLocation(const CKvrCBELocation& location) = 0;
    virtual void OthersChanged() {}
    LRESULT OnRequest(WPARAM request, CKSComm_Package& package) override;
    void OnProjectsChanged() override;
    void RevealChange(const ChangePlace& place) override;

    QVariantMap Arrangement() const override;
    CString PlaceText() const override { return m_lines ? m_lines->LineText() : CString(); }
    CString SelectionText() const override { return m_lines ? m_lines->SelectionText() : CString(); }
    void changeEvent(QEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    virtual void Retranslate() = 0;

private:
    Table AddTable(QSplitter& side, const char* name);
    static void KeepInSight(CGenGrid& table, bool isBeside);
    /// The document, the units or the language are other ones: everything is shown as it is now.
    void ShowDocument();
    void CommandsChanged();
    Answer CommonAnswerTo(WPARAM request);

    std::vector<CGenGrid*> m_tables;
    QSplitter* m_splitter = nullptr; // of picture and tables
    QSplitter* m_side = nullptr;     // of the tables
    QList<int> m_sizes;              // of picture and tables, as shares
    Table m_main, m_parts;
    int m_partsOf = -1; // the line whose parts are shown
    CGenGrid* m_lines = nullptr;
    CGridSearch m_search;
};
