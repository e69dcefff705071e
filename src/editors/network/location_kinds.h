// The kinds of locations on the map: their names, colours and shapes.
#pragma once

#include "ks/fc/exchange.h"

#include <QColor>
#include <QPixmap>
#include <QString>

/// A place on a branch, by name.
struct CMapPlace
{
    QString branch;
    double chainage = 0; // metres
    bool operator==(const CMapPlace&) const = default;
};

/// A location at which an HD parameter is given, copied from an HD document.
struct CMapLocation : CMapPlace
{
    int kind = 0; // HDDataType
    QString file; // path of the HD document
    bool operator==(const CMapLocation&) const = default;
};

/// The kind's name in the user's language.
QString LocationKindName(int kind);
/// The kind's symbol, `size` pixels wide, with an outline that sets it off from the map and from other symbols.
QPixmap LocationKindSymbol(int kind, double size, const QColor& outline);
