// The projects that are open, and which views belong to which.
//
// A project file names member files. A document whose file is a member joins when its view asks the shell (switchboard
// request 25) and then hears when another member's data change (request 522); other projects never do.
#pragma once

#include "files/file_content.h"
#include "files/finding.h"
#include "ks/fc/doc.h"
#include "ks/fc/package.h"

#include <QPointer>
#include <QStringList>
#include <memory>
#include <optional>
#include <vector>

using CProjectHandle = std::intptr_t; // never 0, never used twice

struct CProject
{
    CProjectHandle handle = 0;
    QString path;                       // absolute
    QString name;                       // the file's base name as it can be seen
    QStringList members;                // absolute paths as they are spelt there, in file order
    std::vector<Finding> findings;      // what of the file was not taken as it stands
    std::optional<FileVersion> version; // what the file held when it was read or written here
    FileStatus seen;                    // and what it was then
    std::vector<QPointer<CView>> views; // those that joined
};

class CProjects
{
public:
    /// Reads a project file. Null, with `error` for the user, when that fails. One that is open already is returned.
    const CProject* Open(const QString& path, QString& error);
    /// Reads the file of a project again, which somebody has changed. Views that have joined stay. False, with `error`,
    /// and everything as it was, when that fails.
    bool ReadAgain(CProjectHandle handle, QString& error);
    /// Its views stop being members.
    void Close(CProjectHandle handle);
    const CProject* Find(CProjectHandle handle) const;
    /// The project that a view has joined; null for none.
    const CProject* FindByView(const CView* view) const;
    /// The project that a file joins: of those that it is a member of the preferred one, otherwise the one opened last;
    /// null for none.
    const CProject* FindByMember(const QString& path) const;
    /// The project that files join when several have them, 0 for none; the one from which they are opened.
    void Prefer(CProjectHandle handle) { m_preferred = handle; }
    const std::vector<std::unique_ptr<CProject>>& All() const { return m_projects; }

    /// Answers the switchboard (KsRequest). The package is not kept.
    LRESULT SwitchBoard(WPARAM request, CKSComm_Package& package);
    /// Hands news of a document (KsRequest) on to the views of the other documents of the package's project.
    void Forward(WPARAM request, CKSComm_Package& package);

private:
    std::vector<QPointer<CView>> Others(const CKSComm_Package& package) const;
    LRESULT Ask(WPARAM request, CKSComm_Package& package, bool all);
    void TellOfNewView(CView& view, CProjectHandle project);
    CProject* FindForChange(CProjectHandle handle);
    std::vector<std::unique_ptr<CProject>> m_projects; // in the order of opening
    CProjectHandle m_last = 0, m_preferred = 0;
};
