// The fields below the headers of a table, one a column: what is typed there says which lines are shown.
#pragma once

#include <QObject>
#include <vector>

class CGenGrid;
class CGridHeader;
class QLineEdit;

class CFilterFields : public QObject
{
public:
    /// A child of the header, whose columns the fields stand below.
    CFilterFields(CGenGrid& grid, CGridHeader& header);

    bool AreShown() const { return m_shown; }
    /// What the header needs for them; 0 while they are not shown.
    int Height() const;
    /// Shows the fields, and puts the keys into that of `column`, unless it is negative.
    void Enter(int column);
    /// Takes the fields away; the lines that they hid come back.
    void Leave();
    /// A field has the keys.
    bool HaveFocus() const;
    /// Below the columns, wherever these are now.
    void Place();
    /// In the fields what the lines are filtered by, in the language of now.
    void ShowTexts();

protected:
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    void Make();
    void Typed();
    void OfferTexts(int column);
    bool KeyPressed(int column, int key);
    int ColumnOf(const QObject* field) const;

    CGenGrid& m_grid;
    CGridHeader& m_header;
    std::vector<QLineEdit*> m_fields; // made when they are first shown
    bool m_shown = false;
};
