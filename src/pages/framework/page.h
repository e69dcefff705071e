// Base of every page of the sheet.
#pragma once

#include "data/global_var.h"
#include "grid/grid_host.h"
#include "ks/fc/change_place.h"
#include "ks/units/edit_style.h"
#include "pages/framework/binding.h"
#include "pages/framework/page_host.h"

#include <QString>
#include <QWidget>
#include <memory>
#include <vector>

class CGenGrid;
class CGenList;
class CKavo0_hdDoc;
class HD_RiverPos;

class CGenPropertyPage : public QWidget, public IGridHost
{
    Q_OBJECT
public:
    /// `document` outlives the page. The dialog is set up by the concrete page's constructor.
    explicit CGenPropertyPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CGenPropertyPage() override;

    CKavo0_hdDoc* GetDocument() const { return m_document; }
    void SetHost(IPageHost* host) { m_host = host; } // null in tests
    IPageHost* GetHost() const { return m_host; }
    /// The page's location grid, null on a page without one.
    CGenGrid* GetGrid() const { return m_grid; }
    void SetGrid(CGenGrid* grid);
    /// A further grid of the page.
    void AddPartGrid(CGenGrid* grid);
    /// The grid that inserting and deleting lines mean: a further grid while it has the focus, else the
    /// page's grid; null on a page without one.
    CGenGrid* LinesGrid() const;
    /// Takes the texts being typed into cells; false when one is refused (the user has been told).
    bool CommitGrids();
    /// Takes what is being typed while the page stays in front; false when it is refused (the user has been told).
    bool LeaveField() override;
    /// The list that the page's grid edits; null without one.
    virtual CGenList* GetList() const { return nullptr; }

    // What the grid, the view and other editors' messages call. Rows count from 1.
    virtual void InsertLocation(const QString& riverName, const QString& chainageText);
    virtual void AppendLine();
    virtual void DeleteLines();
    virtual void GotoLine(int row);
    virtual void LoadFromDocument(CKavo0_hdDoc* document);
    virtual void StoreToDocument();
    /// A new record with what the row shows; null when there is no such row. The caller owns it.
    virtual std::unique_ptr<HD_RiverPos> GetRecordAt(int row) const;

    // IGridHost; push buttons are the concrete page's (ButtonClicked).
    void LineEdited(CGenGrid& grid) override;
    void CellCurrent(CGenGrid& grid) override;
    void LineCurrent(CGenGrid& grid) override;
    void Run(CGenGrid& grid, GridAction action) override;
    std::vector<std::pair<QString, double>> CrossSections() override;
    bool CanSearch(const CGenGrid& grid) const override { return &grid == m_grid; }
    std::vector<HostTable> TablesOfPage(CGenGrid& grid) override;
    std::vector<HostTable> TablesOfDocument() override;
    QStringList BranchNames() override;

    /// How many lines have another value than the global one in a field; empty for another field.
    QString OverridesText(const QWidget& field) const;
    /// The help command: what the page is about, and what its fields mean.
    virtual void OnHelp();
    /// Whether what changed is edited on this page.
    virtual bool Shows(const ChangePlace& place) const;
    /// Brings it into view: the line, the cell, the control. With `focus` it is what is edited next.
    virtual void Reveal(const ChangePlace& place, bool focus);
    /// The same for something that stands on the page.
    void ShowControl(QWidget& control, bool focus);

    /// Groups that stand beside each other stand one below the other where the page has no more room than this, and
    /// only there. `scrollBar` is what a scroll bar takes of the width when the page is higher than the room.
    void FitInto(QSize room, int scrollBar);

    /// Takes what is being typed, then undoes or redoes one step of the document.
    void UndoRedo(bool undo);

    /// The page comes to the front: menus, then LoadFromDocument.
    virtual void OnSetActive();
    /// The page is about to be left, saved or closed: everything typed is taken. False keeps the page: a text is no
    /// value (the user has been told, and the field or cell has the focus).
    virtual bool OnKillActive();

protected:
    /// Texts again, in the user's language; the dialog's own texts are the concrete page's.
    virtual void Retranslate() {}

    CBindings& Bindings() { return m_bindings; }
    HD_Global_Var& Globals() const;

    bool event(QEvent* event) override;
    bool eventFilter(QObject* object, QEvent* event) override;
    void changeEvent(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    void StackGroups(int width);
    void UnitsChanged();
    CGenGrid* GridOf(const void* table) const;

    CKavo0_hdDoc* m_document;
    IPageHost* m_host = nullptr;
    CGenGrid* m_grid = nullptr;
    std::vector<CGenGrid*> m_grids; // with the further ones
    CBindings m_bindings;
    KsUnitSystem m_shownUnits; // what the texts on the page are in
};
