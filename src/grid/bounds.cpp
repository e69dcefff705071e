#include "grid/bounds.h"

#include "grid/grid_texts.h"

QString BoundsText(const Bounds& bounds, const CKsEditStyle& style)
{
    const auto& [minimum, maximum] = bounds;
    const auto text = [&style](double bound) { return KsShortestNumber(style.UnitConvertFromBase(bound, 1)); };
    if (minimum && maximum)
        return GridTexts::tr("%1 to %2").arg(text(*minimum), text(*maximum));
    return minimum   ? GridTexts::tr("at least %1").arg(text(*minimum))
           : maximum ? GridTexts::tr("at most %1").arg(text(*maximum))
                     : QString();
}
