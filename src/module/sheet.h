// The sheet of parameter pages: one tab a page, named in a column at the left so that all of them are in sight.
#pragma once

#include "res/strings.h"

#include <QTabWidget>
#include <functional>
#include <vector>

class CGenPropertyPage;
struct ChangePlace;

class CDlgPropertySheet : public QTabWidget
{
    Q_OBJECT
public:
    using MakePage = std::function<std::unique_ptr<CGenPropertyPage>()>;

    explicit CDlgPropertySheet(QWidget* parent);

    /// Adds a tab. Its page is made when it is first asked for, and belongs to the widget tree.
    void AddPage(Str caption, MakePage make);
    // These make the page when nobody has asked for it before.
    CGenPropertyPage* ActivePage();
    CGenPropertyPage* PageAt(int tab);
    /// Makes the next page that has not been made; false when all have.
    bool MakeNextPage();
    int PageCount() const { return count(); }
    /// What is to be known about a page beforehand: an icon on its tab, and a text. Neither when there is nothing.
    void SetNote(int tab, const QIcon& icon, const QString& text);
    /// The tab of the first page that shows a place, made if need be; -1 for none.
    int TabWith(const ChangePlace& place);
    Str CaptionOf(int tab) const { return m_tabs[std::size_t(tab)].caption; }
    /// Switches to a tab: the active page is asked, and only then anything changes. False when it refuses to be left.
    bool SetActivePage(int tab);

signals:
    /// Another page is in front.
    void PageChanged();

protected:
    void changeEvent(QEvent* event) override;

private:
    struct Tab
    {
        Str caption;
        MakePage make;
        CGenPropertyPage* page = nullptr;
    };
    void TabChanged(int tab);

    std::vector<Tab> m_tabs; // in the order of the tab bar
    int m_active = -1;
};
