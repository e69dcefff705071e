// The sheet of parameter pages: one tab a page, named in a column at the left so that all of them are in sight.
#pragma once

#include <QTabWidget>
#include <vector>

class CGenPropertyPage;
class CKavo0_hdView;

class CDlgPropertySheet : public QTabWidget
{
    Q_OBJECT
public:
    explicit CDlgPropertySheet(CKavo0_hdView* view);

    /// Takes the page over (ownership by the widget tree).
    void AddPage(CGenPropertyPage* page);
    CGenPropertyPage* ActivePage() const;
    CGenPropertyPage* PageAt(int tab) const;
    int PageCount() const { return count(); }
    /// Switches to a tab; false when the active page refuses to be left.
    bool SetActivePage(int tab);
    bool SetActivePage(CGenPropertyPage* page);

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void TabChanged(int tab);
    void UpdateCaptions();

    CKavo0_hdView* m_view;
    int m_active = -1;
};
