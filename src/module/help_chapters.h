// The chapters of the help on HD parameters, made from what is declared: one a page, the keys, the problems.
#pragma once

#include "ks/fc/help_window.h"

class CDlgPropertySheet;
class CKavo0_hdDoc;

/// The id of the chapter of a page.
QString ChapterOf(int tab);
/// In the user's language and units.
std::vector<KsHelpChapter> HelpChapters(CDlgPropertySheet& sheet, CKavo0_hdDoc& document);
