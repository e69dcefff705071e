// The texts of grids, fields and their dialogs, in the user's language.
#pragma once

#include <QCoreApplication>

class GridTexts
{
    Q_DECLARE_TR_FUNCTIONS(GridTexts)
public:
    /// Makes the translations available; every editor with grids does so when it is loaded.
    static void Load();
    /// The text for one, or the one for many with their number. Both are translated already.
    static QString Counted(std::size_t count, const QString& one, const QString& many);
};
