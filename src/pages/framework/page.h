// Base of every page of the sheet.
#pragma once

#include "pages/framework/page_host.h"

#include <QString>
#include <QWidget>
#include <memory>

class CGenGrid;
class CGenList;
class CKavo0_hdDoc;
class HD_RiverPos;

class CGenPropertyPage : public QWidget
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
    void SetGrid(CGenGrid* grid) { m_grid = grid; }
    /// The list that the page's grid edits; null without one.
    virtual CGenList* GetList() const { return nullptr; }
    /// Tab caption in the user's language.
    virtual QString Caption() const = 0;

    // What the grid, the view and other editors' messages call. Rows count from 1.
    virtual void InsertLocation(const QString& riverName, const QString& chainageText);
    virtual void AppendLine();
    virtual void DeleteLines();
    virtual void GotoLine(int row);
    virtual void LoadFromDocument(CKavo0_hdDoc* document);
    virtual void StoreToDocument();
    /// A new record with what the row shows; null when there is no such row. The caller owns it.
    virtual std::unique_ptr<HD_RiverPos> GetRecordAt(int row) const;
    virtual void OnGridCellModified(int row, int column);
    virtual void OnGridButtonClicked(int row, int column);

    /// The page comes to the front: menus, then LoadFromDocument.
    virtual void OnSetActive();
    /// The page is about to be left; false keeps it (a field holds something wrong).
    virtual bool OnKillActive();

private:
    CKavo0_hdDoc* m_document;
    IPageHost* m_host = nullptr;
    CGenGrid* m_grid = nullptr;
};
