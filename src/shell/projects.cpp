#include "shell/projects.h"

#include "ks/fc/document_file.h"
#include "ks/fc/exchange.h"
#include "ks/fc/file_name.h"
#include "ks/fc/shown_text.h"
#include "ks/fc/system_reason.h"
#include "shell/project_file.h"

#include <QDir>
#include <QFileInfo>
#include <QTimer>
#include <algorithm>
#include <iterator>
#include <new>

namespace {

bool ReadMembers(CProject& project, QString& error)
{
    ProjectFile read;
    CKsDocumentFile file;
    file.Read(project.path, project.path, [&read](tqlHandle structure, LoadReport& report) {
        ReadDeclaredFile(structure, DeclaredProjectFile(), &read, report);
    });
    error = file.WhyNothing();
    if (!error.isEmpty())
        return false;
    project.findings = file.Findings();
    project.version = file.Version();
    project.seen = file.Seen();
    project.members.clear();
    const QDir folder = QFileInfo(project.path).absoluteDir();
    for (const ProjectMember& member : read.members)
        if (!member.file.empty())
            project.members << member.PathIn(folder);
    project.members.removeDuplicates();
    return true;
}

} // namespace

const CProject* CProjects::Open(const QString& path, QString& error)
try {
    const QString absolute = KsExistingSpelling(QFileInfo(path).absoluteFilePath());
    for (const auto& project : m_projects) {
        if (KsSameFile(project->path, absolute))
            return project.get();
    }
    auto project = std::make_unique<CProject>();
    project->path = absolute;
    project->name = KsVisibleText(QFileInfo(absolute).completeBaseName());
    if (!ReadMembers(*project, error))
        return nullptr;
    project->handle = ++m_last;
    m_projects.push_back(std::move(project));
    return m_projects.back().get();
} catch (const std::bad_alloc&) {
    error = KsSystemSentence(std::make_error_code(std::errc::not_enough_memory));
    return nullptr;
}

bool CProjects::ReadAgain(CProjectHandle handle, QString& error)
{
    CProject* project = FindForChange(handle);
    return project && ReadMembers(*project, error);
}

void CProjects::Close(CProjectHandle handle)
{
    std::erase_if(m_projects, [handle](const auto& project) { return project->handle == handle; });
}

CProject* CProjects::FindForChange(CProjectHandle handle)
{
    const auto found = std::ranges::find(m_projects, handle, [](const auto& project) { return project->handle; });
    return found == m_projects.end() ? nullptr : found->get();
}

const CProject* CProjects::Find(CProjectHandle handle) const
{
    return const_cast<CProjects*>(this)->FindForChange(handle);
}

const CProject* CProjects::FindByView(const CView* view) const
{
    for (const auto& project : m_projects) {
        if (view && std::find(project->views.begin(), project->views.end(), view) != project->views.end())
            return project.get();
    }
    return nullptr;
}

const CProject* CProjects::FindByMember(const QString& path) const
{
    const auto has = [key = KsFileKey(path)](const CProject& project) {
        return std::ranges::find(project.members, key, KsFileKey) != project.members.end();
    };
    const CProject* preferred = Find(m_preferred);
    if (preferred && has(*preferred))
        return preferred;
    const auto found = std::find_if(m_projects.rbegin(), m_projects.rend(), [&](const auto& p) { return has(*p); });
    return found == m_projects.rend() ? nullptr : found->get();
}

/// Views of the project's documents but the sender's.
std::vector<QPointer<CView>> CProjects::Others(const CKSComm_Package& package) const
{
    std::vector<QPointer<CView>> others;
    const CProject* project = Find(package.project);
    if (!project)
        return others;
    // The sender's package may name no view, so its document is known by its path.
    const QString sender = KsFileKey(package.text);
    std::copy_if(project->views.begin(), project->views.end(), std::back_inserter(others), [&](const auto& view) {
        return view && view != package.view && view->GetDocument() &&
               KsFileKey(view->GetDocument()->GetPathName()) != sender;
    });
    return others;
}

/// Asks the other views, all of them or until one has an answer.
LRESULT CProjects::Ask(WPARAM request, CKSComm_Package& package, bool all)
{
    LRESULT answered = 0;
    for (const QPointer<CView>& view : Others(package)) { // a copy: a receiver may leave
        if (!all && answered)
            break;
        if (KsSendMessage(view, KsMessage::BetweenEditors(), request, reinterpret_cast<LPARAM>(&package)))
            answered = 1;
    }
    return answered;
}

/// A file that comes back to its project is news to the others, once its view can answer what they then ask.
void CProjects::TellOfNewView(CView& view, CProjectHandle project)
{
    QTimer::singleShot(0, &view, [this, &view, project] {
        CKSComm_Package news;
        news.view = &view;
        news.project = project;
        Forward(KsRequest::DataChanged, news);
    });
}

LRESULT CProjects::SwitchBoard(WPARAM request, CKSComm_Package& package)
{
    switch (request) {
    case KsRequest::JoinProject: {
        const CProject* found = package.text.isEmpty() ? nullptr : FindByMember(package.text);
        if (!found)
            return 0;
        CProject* project = FindForChange(found->handle);
        if (package.view && FindByView(package.view) != project) {
            project->views.emplace_back(package.view);
            TellOfNewView(*package.view, project->handle);
        }
        return project->handle;
    }
    case KsRequest::LeaveProject:
        if (CProject* project = FindForChange(package.project))
            std::erase_if(project->views, [&](const QPointer<CView>& view) { return !view || view == package.view; });
        return 0;
    case KsRequest::LoadLocations:
    case KsRequest::BranchNames:
    case KsRequest::BedLevels:
    case KsRequest::Branches:
        return package.objects ? Ask(request, package, true) : 0;
    case KsRequest::LoadLocationsAndChannel:
        if (!package.objects || !Ask(KsRequest::LoadLocations, package, true))
            return 0;
        Ask(request, package, true);
        return 1;
    case KsRequest::FetchLocation:
        return package.objects ? Ask(request, package, false) : 0;
    case KsRequest::ProjectViews:
        if (!package.objects)
            return 0;
        for (const QPointer<CView>& view : Others(package)) {
            auto item = std::make_unique<CKvrCBEView>();
            item->view = view;
            package.objects->push_back(std::move(item));
        }
        return 1;
    default:
        qDebug("switchboard: unknown request %llu", static_cast<unsigned long long>(request));
        return 0;
    }
}

void CProjects::Forward(WPARAM request, CKSComm_Package& package)
{
    if (request == KsRequest::DataChanged || request == KsRequest::LocationShown)
        Ask(request, package, true);
}
