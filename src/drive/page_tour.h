// A visit to every page of the sheet: a picture of each, one global and one local value changed, and both found again
// later.
#pragma once

#include <QString>
#include <vector>

class QTabWidget;
class QWidget;
class Robot;

/// What was changed on one page, as it is shown there.
struct PageChange
{
    int tab = 0;
    QString page;
    QString control, controlText; // empty where the page has no single field to change
    int row = -1, column = -1;    // of the page's first grid; -1 without a local value
    QString cellText;
};

/// Clicks the tab of a page and returns the page.
QWidget* GoToTab(Robot& robot, QTabWidget* sheet, int tab);
/// Visits every tab, changes values and takes a picture of each page.
std::vector<PageChange> ChangeEveryPage(Robot& robot);
/// Visits the changed pages again and compares what they show.
void VerifyEveryPage(Robot& robot, const std::vector<PageChange>& changes);
