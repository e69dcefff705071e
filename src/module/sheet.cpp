#include "module/sheet.h"

#include "pages/framework/page.h"

#include <QApplication>
#include <QHash>
#include <QKeyEvent>
#include <QScrollArea>
#include <QScrollBar>
#include <QShortcut>
#include <QSignalBlocker>
#include <QStyleOptionTab>
#include <QStylePainter>
#include <QTabBar>
#include <QVBoxLayout>
#include <algorithm>

namespace {

constexpr int TabHeight = 24; // with which all tabs have room in a low window; where the font needs more, less air

/// A tab column whose captions read from left to right. It chooses nothing itself: whoever is being edited is asked
/// before another tab comes to the front.
class SideTabBar : public QTabBar
{
public:
    SideTabBar(CDlgPropertySheet* sheet) : QTabBar(sheet), m_sheet(sheet) {}

    QSize tabSizeHint(int index) const override
    {
        // Every tab that is added has all of them asked for their size.
        QSize& text = m_sizes[tabText(index)];
        if (text.isEmpty())
            text = fontMetrics().size(Qt::TextShowMnemonic, tabText(index));
        const int air = std::clamp(TabHeight - text.height(), 4, fontMetrics().height() * 2 / 3);
        return {text.width() + 2 * fontMetrics().height(), text.height() + air};
    }
    QSize minimumTabSizeHint(int index) const override { return tabSizeHint(index); }

protected:
    void mousePressEvent(QMouseEvent* event) override
    {
        const int tab = tabAt(event->position().toPoint());
        if (tab >= 0 && event->button() == Qt::LeftButton)
            m_sheet->SetActivePage(tab);
        else
            QTabBar::mousePressEvent(event); // the buttons that scroll
    }
    void wheelEvent(QWheelEvent* event) override
    {
        m_wheel += event->angleDelta().y();
        const int steps = m_wheel / QWheelEvent::DefaultDeltasPerStep;
        m_wheel -= steps * QWheelEvent::DefaultDeltasPerStep;
        if (steps != 0)
            m_sheet->SetActivePage(std::clamp(currentIndex() - steps, 0, count() - 1));
    }
    void keyPressEvent(QKeyEvent* event) override
    {
        const int key = event->key();
        const int step = key == Qt::Key_Up || key == Qt::Key_Left ? -1 : key == Qt::Key_Down || key == Qt::Key_Right;
        const int tab = key == Qt::Key_Home ? 0 : key == Qt::Key_End ? count() - 1 : currentIndex() + step;
        if (tab == currentIndex())
            QTabBar::keyPressEvent(event);
        else if (m_sheet->SetActivePage(tab))
            setFocus();
    }
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
            // Some styles and colors set the current tab off by a shade that nobody sees.
            if (i == currentIndex()) {
                QColor tint = palette().color(QPalette::Highlight);
                painter.fillRect(QRect(option.rect.topLeft(), QSize(3, option.rect.height())), tint);
                tint.setAlphaF(0.25F);
                painter.fillRect(option.rect.adjusted(3, 1, 0, -1), tint);
            }
            const QRect text = option.rect.adjusted(fontMetrics().height() * 2 / 3, 0, -4, 0);
            const auto role = option.state & QStyle::State_Enabled ? QPalette::Normal : QPalette::Disabled;
            style()->drawItemText(&painter, text, Qt::AlignVCenter | Qt::AlignLeft | Qt::TextShowMnemonic, palette(),
                                  role == QPalette::Normal, tabText(i), QPalette::WindowText);
            const int size = fontMetrics().height() * 3 / 4;
            if (const QIcon note = tabIcon(i); !note.isNull())
                note.paint(&painter,
                           QRect(option.rect.right() - size - 4, option.rect.top(), size, option.rect.height()));
            if (hasFocus() && i == currentIndex()) {
                QStyleOptionFocusRect focus;
                focus.initFrom(this);
                focus.rect = option.rect.adjusted(3, 3, -3, -3);
                painter.drawPrimitive(QStyle::PE_FrameFocusRect, focus);
            }
        }
    }

private:
    CDlgPropertySheet* m_sheet;
    int m_wheel = 0;                       // turned since the last step
    mutable QHash<QString, QSize> m_sizes; // of captions in the present font
};

/// In a small window a page scrolls rather than being cut off, and stacks what stands beside each other rather than
/// scrolling sideways.
class PageArea : public QScrollArea
{
public:
    explicit PageArea(CGenPropertyPage& page) : m_page(page)
    {
        setWidgetResizable(true);
        setFrameShape(QFrame::NoFrame);
        setFocusPolicy(Qt::NoFocus);
        viewport()->setAutoFillBackground(false);
        setWidget(&page);
        page.setAutoFillBackground(false);
    }

protected:
    void resizeEvent(QResizeEvent* event) override
    {
        Fit();
        QScrollArea::resizeEvent(event);
    }
    void changeEvent(QEvent* event) override
    {
        QScrollArea::changeEvent(event);
        const auto fit = [this] { Fit(); };
        if (event->type() == QEvent::LanguageChange || event->type() == QEvent::FontChange)
            QMetaObject::invokeMethod(this, fit, Qt::QueuedConnection); // when the page has the new texts
    }

private:
    /// Whether a scroll bar is there now depends on how the page stood before: it must not decide how it stands next.
    void Fit() { m_page.FitInto(maximumViewportSize(), verticalScrollBar()->sizeHint().width()); }

    CGenPropertyPage& m_page;
};

} // namespace

CDlgPropertySheet::CDlgPropertySheet(QWidget* parent) : QTabWidget(parent)
{
    setObjectName("sheet");
    setTabBar(new SideTabBar(this));
    setTabPosition(QTabWidget::West);
    setUsesScrollButtons(true);
    connect(this, &QTabWidget::currentChanged, this, &CDlgPropertySheet::TabChanged);
    const auto addKey = [this](Qt::Key key, int step) {
        const auto* shortcut =
            new QShortcut(QKeySequence(Qt::CTRL | key), this, nullptr, nullptr, Qt::WidgetWithChildrenShortcut);
        connect(shortcut, &QShortcut::activated, this, [this, step] { SetActivePage(m_active + step); });
    };
    addKey(Qt::Key_PageUp, -1);
    addKey(Qt::Key_PageDown, 1);
}

void CDlgPropertySheet::AddPage(Str caption, MakePage make)
{
    m_tabs.push_back({caption, std::move(make)});
    const QSignalBlocker quiet(this);
    addTab(new QWidget, LoadString(caption));
    if (m_active < 0)
        m_active = 0;
}

int CDlgPropertySheet::TabWith(const ChangePlace& place)
{
    for (int tab = 0; tab < count(); ++tab)
        if (PageAt(tab)->Shows(place))
            return tab;
    return -1;
}

void CDlgPropertySheet::SetNote(int tab, const QIcon& icon, const QString& text)
{
    if (icon.isNull() && tabIcon(tab).isNull())
        return;
    setTabIcon(tab, icon);
    setTabToolTip(tab, text);
}

CGenPropertyPage* CDlgPropertySheet::PageAt(int tab)
{
    if (tab < 0 || tab >= count())
        return nullptr;
    Tab& entry = m_tabs[std::size_t(tab)];
    if (!entry.page) {
        entry.page = entry.make().release();
        auto* layout = new QVBoxLayout(widget(tab));
        layout->setContentsMargins(0, 0, 0, 0);
        layout->addWidget(new PageArea(*entry.page));
    }
    return entry.page;
}

bool CDlgPropertySheet::MakeNextPage()
{
    const auto next = std::find_if(m_tabs.begin(), m_tabs.end(), [](const Tab& tab) { return !tab.page; });
    return next != m_tabs.end() && PageAt(int(next - m_tabs.begin()));
}

CGenPropertyPage* CDlgPropertySheet::ActivePage()
{
    return PageAt(m_active);
}

/// Tools for people who do not see the screen press a tab directly. The page in front comes back before it is asked.
void CDlgPropertySheet::TabChanged(int tab)
{
    if (tab == m_active)
        return;
    {
        const QSignalBlocker quiet(this);
        setCurrentIndex(m_active);
    }
    SetActivePage(tab);
}

bool CDlgPropertySheet::SetActivePage(int tab)
{
    if (tab < 0 || tab >= count() || tab == m_active)
        return tab == m_active;
    if (CGenPropertyPage* left = ActivePage(); left && !left->OnKillActive())
        return false;
    m_active = tab;
    setCurrentIndex(tab);
    if (CGenPropertyPage* entered = ActivePage())
        entered->OnSetActive();
    emit PageChanged();
    return true;
}

void CDlgPropertySheet::changeEvent(QEvent* event)
{
    QTabWidget::changeEvent(event);
    for (int tab = 0; event->type() == QEvent::LanguageChange && tab < count(); ++tab)
        setTabText(tab, LoadString(m_tabs[std::size_t(tab)].caption));
}
