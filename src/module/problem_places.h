// Where on the sheet values of the file are, as problems name them: of many in one go, as long as no page changes.
#pragma once

#include "ks/fc/change_place.h"
#include "problems/problem_host.h"

#include <map>

class CDlgPropertySheet;
class CGenGrid;
class CGenParamListBase;
class CKavo0_hdDoc;

/// The column that shows the field of a place, counted from 1, or, of several for the elements of a group, that of the
/// element; 0 for none.
int ColumnOf(const CGenGrid& grid, const ProblemPlace& place);

class CProblemPlaces
{
public:
    CProblemPlaces(CDlgPropertySheet& sheet, CKavo0_hdDoc& document) : m_sheet(sheet), m_document(document) {}

    /// How the sheet names it; nothing for a line that has gone, and for what no page shows.
    ChangePlace On(const ProblemPlace& place);
    ProblemWhere WhereIs(const ProblemPlace& place);
    /// The tab that shows it; -1 for none.
    int TabOf(const ProblemPlace& place) { return Find(On(place)).tab; }
    /// The table of a list of the file; null where no page has one.
    CGenGrid* TableOf(const ProblemPlace& place);

private:
    struct Shown
    {
        int tab = -1;
        CGenGrid* table = nullptr;
    };
    Shown Find(const ChangePlace& place);
    CGenParamListBase* ListOf(const ProblemPlace& place) const;
    ChangePlace InList(const ProblemPlace& place);
    ChangePlace InGlobals(const ProblemPlace& place);
    static QString FieldText(const ProblemPlace& place, const ChangePlace& shown, const CGenGrid* table);

    CDlgPropertySheet& m_sheet;
    CKavo0_hdDoc& m_document;
    std::map<const void*, Shown> m_known; // by the list or table
};
