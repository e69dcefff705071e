// Puts the places that other editors send into a page's grid of locations.
#pragma once

#include "ks/fc/exchange.h"

class CGenPropertyPage;

/// Which values of the places go into the columns that hold them (ColumnSpec::locationValue).
struct LocationValues
{
    bool radius = false, width = false;
};

struct LoadedLocations
{
    int added = 0;
    int known = 0;   // had a line already; it stays
    int changed = 0; // of these, lines that got another radius or width
};

/// One undo step: a line for each place (CKvrCBELocation) that has none yet, at the end in the order of the places,
/// with what new lines have in the other columns; lines that are there get the values alone. A place without branch or
/// chainage, a value that is unset and a locked cell are passed over. The project is told.
LoadedLocations LoadLocations(CGenPropertyPage& page, const CObList& places, LocationValues values);
