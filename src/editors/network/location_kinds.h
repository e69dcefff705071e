// The kinds of locations on the map: their names, colours and shapes.
#pragma once

#include "ks/fc/exchange.h"

#include <QColor>
#include <QPixmap>
#include <QString>

/// A location at which an HD parameter is given, copied from an HD document.
struct CMapLocation
{
    QString branch;
    double chainage = 0;     // metres
    int kind = 0;            // HDDataType
    QString file;            // path of the HD document
    double second = KsUnset; // as in the document's item
};

/// The kind's name in the user's language.
QString LocationKindName(int kind);
QColor LocationKindColour(int kind);
/// The kind's symbol, `size` pixels wide, with an outline that sets it off from the map and from other symbols.
QPixmap LocationKindSymbol(int kind, double size, const QColor& outline);
