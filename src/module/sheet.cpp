#include "module/sheet.h"

#include "module/view.h"
#include "pages/framework/page.h"

#include <QHash>
#include <QKeyEvent>
#include <QScrollArea>
#include <QSignalBlocker>
#include <QStyleOptionTab>
#include <QStylePainter>
#include <QTabBar>
#include <QVBoxLayout>
#include <algorithm>

namespace {

/// A tab column whose captions read from left to right.
class SideTabBar : public QTabBar
{
public:
    using QTabBar::QTabBar;

    QSize tabSizeHint(int index) const override
    {
        // Every tab that is added has all of them asked for their size.
        QSize& text = m_sizes[tabText(index)];
        if (text.isEmpty())
            text = fontMetrics().size(Qt::TextShowMnemonic, tabText(index));
        return {text.width() + 3 * fontMetrics().height(), text.height() + fontMetrics().height() * 2 / 3};
    }
    QSize minimumTabSizeHint(int index) const override { return tabSizeHint(index); }

protected:
    void changeEvent(QEvent* event) override
    {
        if (event->type() == QEvent::FontChange || event->type() == QEvent::StyleChange)
            m_sizes.clear();
        QTabBar::changeEvent(event);
    }
    void paintEvent(QPaintEvent*) override
    {
        QStylePainter painter(this);
        for (int i = 0; i < count(); ++i) {
            QStyleOptionTab option;
            initStyleOption(&option, i);
            painter.drawControl(QStyle::CE_TabBarTabShape, option);
            const QRect text = option.rect.adjusted(fontMetrics().height() * 2 / 3, 0, -4, 0);
            const auto role = option.state & QStyle::State_Enabled ? QPalette::Normal : QPalette::Disabled;
            style()->drawItemText(&painter, text, Qt::AlignVCenter | Qt::AlignLeft | Qt::TextShowMnemonic, palette(),
                                  role == QPalette::Normal, tabText(i), QPalette::WindowText);
            if (hasFocus() && i == currentIndex()) {
                QStyleOptionFocusRect focus;
                focus.initFrom(this);
                focus.rect = option.rect.adjusted(3, 3, -3, -3);
                painter.drawPrimitive(QStyle::PE_FrameFocusRect, focus);
            }
        }
    }

private:
    mutable QHash<QString, QSize> m_sizes; // of captions in the present font
};

} // namespace

CDlgPropertySheet::CDlgPropertySheet(CKavo0_hdView* view) : QTabWidget(view), m_view(view)
{
    setObjectName("sheet");
    setTabBar(new SideTabBar(this));
    setTabPosition(QTabWidget::West);
    setUsesScrollButtons(true);
    connect(this, &QTabWidget::currentChanged, this, &CDlgPropertySheet::TabChanged);
}

void CDlgPropertySheet::AddPage(Str caption, MakePage make)
{
    m_tabs.push_back({caption, std::move(make)});
    const QSignalBlocker quiet(this);
    addTab(new QWidget, LoadString(caption));
    if (m_active < 0)
        m_active = 0;
}

CGenPropertyPage* CDlgPropertySheet::PageAt(int tab) const
{
    if (tab < 0 || tab >= count())
        return nullptr;
    Tab& entry = m_tabs[std::size_t(tab)];
    if (!entry.page) {
        entry.page = entry.make().release();
        entry.page->installEventFilter(const_cast<CDlgPropertySheet*>(this));
        auto* area = new QScrollArea; // in a small window a page scrolls rather than being cut off
        area->setWidgetResizable(true);
        area->setFrameShape(QFrame::NoFrame);
        area->setFocusPolicy(Qt::NoFocus);
        area->viewport()->setAutoFillBackground(false);
        area->setWidget(entry.page);
        entry.page->setAutoFillBackground(false);
        auto* layout = new QVBoxLayout(widget(tab));
        layout->setContentsMargins(0, 0, 0, 0);
        layout->addWidget(area);
    }
    return entry.page;
}

bool CDlgPropertySheet::MakeNextPage() const
{
    const auto next = std::find_if(m_tabs.begin(), m_tabs.end(), [](const Tab& tab) { return !tab.page; });
    return next != m_tabs.end() && PageAt(int(next - m_tabs.begin()));
}

CGenPropertyPage* CDlgPropertySheet::ActivePage() const
{
    return PageAt(m_active);
}

void CDlgPropertySheet::TabChanged(int tab)
{
    if (tab == m_active)
        return;
    // The tab bar has switched already; a page that may not be left comes back before anything was painted.
    if (auto* left = ActivePage(); left && !left->OnKillActive()) {
        const QSignalBlocker quiet(this);
        setCurrentIndex(m_active);
        return;
    }
    m_active = tab;
    if (auto* entered = ActivePage())
        entered->OnSetActive();
}

bool CDlgPropertySheet::SetActivePage(int tab)
{
    if (tab >= 0 && tab < count())
        setCurrentIndex(tab);
    return m_active == tab;
}

bool CDlgPropertySheet::eventFilter(QObject* watched, QEvent* event)
{
    // Ctrl+F4 belongs to the document window even while the focus is in a page.
    if (event->type() == QEvent::KeyPress) {
        const auto* key = static_cast<QKeyEvent*>(event);
        if (key->key() == Qt::Key_F4 && key->modifiers() & Qt::ControlModifier) {
            m_view->CloseWindow();
            return true;
        }
    }
    return QTabWidget::eventFilter(watched, event);
}

void CDlgPropertySheet::changeEvent(QEvent* event)
{
    QTabWidget::changeEvent(event);
    for (int tab = 0; event->type() == QEvent::LanguageChange && tab < count(); ++tab)
        setTabText(tab, LoadString(m_tabs[std::size_t(tab)].caption));
}
