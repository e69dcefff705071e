// The titles of the user-defined marks as rows of a grid. A title is also a column of levels: putting a title in or
// taking it out moves the levels of every location along.
#pragma once

#include "grid/row_source.h"

#include <cstdint>
#include <string>

class CKavo0_hdDoc;
class HD_Global_Var;

/// The object of a row: a title of the document, or one that is not in it.
struct MarkTitle
{
    HD_Global_Var* globals = nullptr; // null for a title that is not in the document
    std::size_t index = 0;            // in the document
    std::string title;                // of one that is not
    bool interpolate = false;

    std::string Title() const;
    void SetTitle(const std::string& text);
    /// Missing flags are off; setting one lengthens the list of flags up to it.
    bool Interpolate() const;
    void SetInterpolate(bool on);
};

std::shared_ptr<IRowSource> MakeMarkTitleRows(CKavo0_hdDoc& document);
