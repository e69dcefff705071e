#include "shell/appearance.h"

#include "shell/settings_keys.h"

#include <QApplication>
#include <QPalette>
#include <QSettings>
#include <QStyle>
#include <QStyleFactory>
#include <utility>

namespace {

struct Colors
{
    QRgb window, base, alternate, button, text, tip, disabled, highlight, highlightedText, link;
};
constexpr Colors Light{0xffefefef, 0xffffffff, 0xfff7f7f7, 0xffefefef, 0xff000000,
                       0xffffffdc, 0xff8c8c8c, 0xff308cc6, 0xffffffff, 0xff0057ae};
constexpr Colors Dark{0xff2a2e32, 0xff1b1e20, 0xff232629, 0xff31363b, 0xfffcfcfc,
                      0xff31363b, 0xff8a9097, 0xff3daee9, 0xff101214, 0xff4db6f0};

QPalette PaletteOf(const Colors& colors)
{
    QPalette palette(QColor(colors.button), QColor(colors.window)); // shades from these
    for (const auto& [role, color] :
         {std::pair(QPalette::WindowText, colors.text), std::pair(QPalette::Text, colors.text),
          std::pair(QPalette::ButtonText, colors.text), std::pair(QPalette::ToolTipText, colors.text),
          std::pair(QPalette::Base, colors.base), std::pair(QPalette::AlternateBase, colors.alternate),
          std::pair(QPalette::ToolTipBase, colors.tip), std::pair(QPalette::Highlight, colors.highlight),
          std::pair(QPalette::HighlightedText, colors.highlightedText), std::pair(QPalette::Link, colors.link),
          std::pair(QPalette::LinkVisited, colors.link), std::pair(QPalette::PlaceholderText, colors.disabled)})
        palette.setColor(role, QColor(color));
    for (const QPalette::ColorRole role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText})
        palette.setColor(QPalette::Disabled, role, QColor(colors.disabled));
    return palette;
}

/// The desktop's own, as it was when the program started.
QString& StyleOfDesktop()
{
    static QString name;
    return name;
}

void Apply(Appearance appearance)
{
    if (StyleOfDesktop().isEmpty())
        StyleOfDesktop() = QApplication::style()->name();
    const bool isSystem = appearance == Appearance::System;
    // The style of another desktop may paint with colors of its own, whatever the palette says.
    QApplication::setStyle(QStyleFactory::create(isSystem ? StyleOfDesktop() : QStringLiteral("Fusion")));
    QApplication::setPalette(isSystem ? QPalette() : PaletteOf(appearance == Appearance::Dark ? Dark : Light));
}

} // namespace

Appearance ChosenAppearance()
{
    const QString chosen = QSettings().value(Settings::Appearance).toString();
    return chosen == QLatin1String("dark")    ? Appearance::Dark
           : chosen == QLatin1String("light") ? Appearance::Light
                                              : Appearance::System;
}

void ChooseAppearance(Appearance appearance)
{
    constexpr const char* names[] = {"system", "light", "dark"};
    QSettings().setValue(Settings::Appearance, QString::fromLatin1(names[std::size_t(appearance)]));
    Apply(appearance);
}

void ApplyChosenAppearance()
{
    if (const Appearance chosen = ChosenAppearance(); chosen != Appearance::System)
        Apply(chosen);
}
