#include "shell/editor_bars.h"

#include "ks/fc/frames.h"
#include "shell/plugin_loader.h"
#include "shell/settings_keys.h"

#include <QFileInfo>
#include <QSettings>

namespace {
constexpr unsigned FirstBarId = 0xE880; // control ids of the editors' bars, above those of the frame's own
} // namespace

CEditorBars::CEditorBars(CKsMDIFrameWnd& frame, const CPlugins& plugins) : m_frame(frame), m_plugins(plugins) {}

void CEditorBars::Create()
{
    for (Bar& bar : m_bars)
        delete bar.bar;
    m_bars.clear();
    for (const auto& plugin : m_plugins.All()) {
        if (plugin->IsUsable())
            AddBars(*plugin);
    }
    Update();
}

void CEditorBars::AddBars(const CPlugin& plugin)
{
    const QStringList hidden = QSettings().value(Settings::HiddenBars).toStringList();
    const QStringList names = plugin.ToolBarNames();
    for (int i = 0; i < names.size(); ++i) {
        auto toggle = std::make_unique<QAction>(names[i]);
        toggle->setObjectName(QStringLiteral("%1-%2").arg(QFileInfo(plugin.file).completeBaseName()).arg(i));
        toggle->setCheckable(true);
        toggle->setChecked(!hidden.contains(toggle->objectName()));
        connect(toggle.get(), &QAction::toggled, this, [this] {
            Update();
            SaveHidden();
        });
        m_bars.push_back({&plugin, i, nullptr, std::move(toggle)});
    }
}

void CEditorBars::Show(const CView* view, bool show)
{
    const CMultiDocTemplate* documents = view && view->GetDocument() ? view->GetDocument()->GetDocTemplate() : nullptr;
    const CPlugin* plugin = m_plugins.Of(documents);
    if (!plugin)
        return;
    m_shown[plugin] = show;
    Update();
}

std::vector<QAction*> CEditorBars::Toggles() const
{
    std::vector<QAction*> toggles;
    for (const Bar& bar : m_bars)
        toggles.push_back(bar.toggle.get());
    return toggles;
}

void CEditorBars::Update()
{
    for (std::size_t i = 0; i < m_bars.size(); ++i) {
        Bar& bar = m_bars[i];
        const bool visible = bar.toggle->isChecked() && m_shown[bar.plugin];
        if (visible && !bar.bar) {
            bar.bar = bar.plugin->CreateToolBar(m_frame, FirstBarId + unsigned(i), bar.index);
            if (!bar.bar)
                continue;
            bar.bar->setObjectName(bar.toggle->objectName());
            bar.bar->setWindowTitle(bar.toggle->text());
        }
        if (bar.bar)
            bar.bar->setVisible(visible);
    }
}

void CEditorBars::SaveHidden() const
{
    QStringList hidden;
    for (const Bar& bar : m_bars) {
        if (!bar.toggle->isChecked())
            hidden << bar.toggle->objectName();
    }
    QSettings().setValue(Settings::HiddenBars, hidden);
}
