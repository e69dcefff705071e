// What the long profile asks of the view that shows it.
#pragma once

#include <QString>
#include <QStringList>
#include <vector>

class CGenGrid;
class QWidget;

/// A table of lines whose first two columns are branch name and chainage.
struct ProfileTable
{
    int tab = 0;  // of its page
    QString page; // as the user calls it
    CGenGrid* grid = nullptr;
};

/// The ground at a cross section: metres above datum; not a number for what is not known.
struct BedLevel
{
    double chainage = 0; // metres
    double bed = 0, leftBank = 0, rightBank = 0;
};

class IProfileHost
{
public:
    virtual ~IProfileHost() = default;
    /// Of all pages, in their order.
    virtual std::vector<ProfileTable> ProfileTables() = 0;
    /// The tab that is in front.
    virtual int FrontTab() const = 0;
    /// Those that the project's network knows.
    virtual QStringList ProfileBranches() = 0;
    /// From the project's cross sections, by increasing chainage; empty outside a project.
    virtual std::vector<BedLevel> BedLevels(const QString& branch) = 0;
    /// Whether what the field, by its name in the file, says are depths above the bed now.
    virtual bool AreDepths(std::string_view field) const = 0;
    /// Takes what is being typed; false when it is refused (the user has been told).
    virtual bool MayLeaveField() = 0;
    /// Brings the cell of a line, by its place in the file, into view. False when the page in front may not be left.
    virtual bool ShowCell(const ProfileTable& table, std::size_t row, int column) = 0;
};
