// The column headers of a grid: marks of the sorting, and below the headers the fields that filter the lines.
#pragma once

#include <QHeaderView>
#include <vector>

class CGenGrid;
class QLabel;
class QLineEdit;

class CGridHeader : public QHeaderView
{
    Q_OBJECT
public:
    /// A child of the grid.
    explicit CGridHeader(CGenGrid& grid);

    QSize sizeHint() const override;
    /// Shows the fields, and puts the keys into that of `column`.
    void EnterFilter(int column);
    /// Takes the fields away; the lines that they hid come back.
    void LeaveFilter();
    /// A field has the keys.
    bool IsTypingFilter() const;

protected:
    void initStyleOptionForIndex(QStyleOptionHeader* option, int column) const override;
    QSize sectionSizeFromContents(int column) const override;
    void paintSection(QPainter* painter, const QRect& rect, int column) const override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void changeEvent(QEvent* event) override;
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    bool AreFieldsShown() const { return m_fieldsShown; }
    int FieldHeight() const;
    void MakeFields();
    void PlaceFields();
    void ShowTexts();
    void Typed();
    void OfferTexts(int column);
    bool KeyPressed(int column, int key);
    void ShowCount();
    int ColumnOf(const QObject* field) const;

    CGenGrid& m_grid;
    std::vector<QLineEdit*> m_fields; // one a column; made when they are first shown
    QLabel* m_count;                  // how many lines are shown, beside the scroll bar
    bool m_fieldsShown = false;
};
