#include "grid/grid_texts.h"

#include "ks/language/language.h"

void GridTexts::Load()
{
    KsLangLoadResDll("Kvr_grid", nullptr, 0); // by name: editors share them, and none gives them back
}

QString GridTexts::Counted(std::size_t count, const QString& one, const QString& many)
{
    return count == 1 ? one : many.arg(count);
}
