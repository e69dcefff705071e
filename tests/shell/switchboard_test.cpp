// Who is asked by the switchboard, and whose answers count. The views are the test's own.
#include "ks/fc/exchange.h"
#include "shell/projects.h"

#include <QFile>
#include <QTemporaryDir>
#include <cmath>
#include <functional>
#include <gtest/gtest.h>

namespace {

class Doc : public CKsDoc
{
public:
    BOOL OnSaveDocument(const CString&) override { return false; }
};

/// One editor's document and view.
class Editor : public CView
{
public:
    Editor(CProjects& shell, const QString& path) : projects(shell)
    {
        document.SetPathName(path);
        document.AddView(this);
        project = Ask(KsRequest::JoinProject);
    }
    LRESULT Ask(WPARAM request, CObList* objects = nullptr)
    {
        CKSComm_Package package = Package(objects);
        return projects.SwitchBoard(request, package);
    }
    CKSComm_Package Package(CObList* objects)
    {
        CKSComm_Package package;
        package.view = this;
        package.text = document.GetPathName();
        package.project = project;
        package.objects = objects;
        return package;
    }
    LRESULT WindowProc(unsigned message, WPARAM request, LPARAM lParam) override
    {
        EXPECT_EQ(message, KsMessage::BetweenEditors());
        heard << int(request);
        return answer ? answer(request, reinterpret_cast<CKSComm_Package*>(lParam)->objects) : 0;
    }

    CProjects& projects;
    Doc document;
    std::intptr_t project = 0;
    QList<int> heard;
    std::function<LRESULT(WPARAM, CObList*)> answer;
};

LRESULT Give(CObList* objects, const char* branch, double chainage)
{
    auto place = std::make_unique<CKvrCBELocation>();
    place->branch = branch;
    place->chainage = chainage;
    objects->push_back(std::move(place));
    return 1;
}

const CKvrCBELocation& PlaceAt(const CObList& objects, std::size_t index)
{
    return dynamic_cast<const CKvrCBELocation&>(*objects.at(index));
}

class SwitchboardTest : public testing::Test
{
protected:
    SwitchboardTest()
    {
        Open("one", "File = <a.hdkv>\nFile = <b.hdkv>\nFile = <net.kvnw>\nFile = <sections.kvxs>\n");
        Open("two", "File = <c.hdkv>\nFile = <other.kvnw>\n");
        a = Join("a.hdkv"), b = Join("b.hdkv"), net = Join("net.kvnw"), sections = Join("sections.kvxs");
        c = Join("c.hdkv"), other = Join("other.kvnw");
    }
    void Open(const QString& name, const QByteArray& members)
    {
        QFile file(folder.filePath(name + ".kvrp"));
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write("[KVR_PROJECT]\n[Members]\n" + members + "[/Members]\n[/KVR_PROJECT]\n");
        file.close();
        QString error;
        EXPECT_NE(projects.Open(file.fileName(), error), nullptr) << qPrintable(error);
    }
    std::unique_ptr<Editor> Join(const char* name) { return std::make_unique<Editor>(projects, folder.filePath(name)); }
    void ForgetHeard()
    {
        for (Editor* editor : {a.get(), b.get(), net.get(), sections.get(), c.get(), other.get()})
            editor->heard.clear();
    }

    QTemporaryDir folder;
    CProjects projects;
    std::unique_ptr<Editor> a, b, net, sections, c, other;
};

TEST_F(SwitchboardTest, RequestsReachTheOtherViewsOfTheProjectAlone)
{
    CObList objects;
    struct Case
    {
        WPARAM request;
        QList<int> others; // what each other editor hears when nobody has an answer
    };
    for (const Case& asked : {Case{KsRequest::LoadLocations, {40}}, Case{KsRequest::LoadLocationsAndChannel, {40}},
                              Case{KsRequest::BranchNames, {201}}, Case{KsRequest::FetchLocation, {200}}}) {
        SCOPED_TRACE(asked.request);
        ForgetHeard();
        EXPECT_EQ(a->Ask(asked.request, &objects), 0) << "nobody had anything";
        for (const Editor* editor : {b.get(), net.get(), sections.get()})
            EXPECT_TRUE(editor->heard == asked.others);
        EXPECT_TRUE(a->heard.isEmpty() && c->heard.isEmpty() && other->heard.isEmpty());
        ForgetHeard();
        EXPECT_EQ(a->Ask(asked.request), 0) << "nowhere to put an answer";
        EXPECT_TRUE(b->heard.isEmpty() && net->heard.isEmpty() && sections->heard.isEmpty());
    }
    for (const WPARAM news : {KsRequest::DataChanged, KsRequest::LocationShown, WPARAM(41), WPARAM(40)}) {
        SCOPED_TRACE(news);
        ForgetHeard();
        CKSComm_Package package = c->Package(nullptr);
        package.view = nullptr; // the document tells, not a view
        projects.Forward(news, package);
        const bool forwarded = news == KsRequest::DataChanged || news == KsRequest::LocationShown;
        EXPECT_EQ(other->heard.size(), forwarded ? 1 : 0);
        EXPECT_TRUE(a->heard.isEmpty() && net->heard.isEmpty() && c->heard.isEmpty());
    }
    EXPECT_TRUE(objects.empty());
}

TEST_F(SwitchboardTest, LocationsComeFromAllAndThenRadiusAndWidth)
{
    sections->answer = [](WPARAM request, CObList* objects) -> LRESULT {
        return request == KsRequest::LoadLocations && Give(objects, "MAIN", 10) && Give(objects, "MAIN", 20);
    };
    net->answer = [](WPARAM request, CObList* objects) -> LRESULT {
        if (request == KsRequest::LoadLocations)
            return Give(objects, "SIDE", 5);
        for (const auto& item : *objects) {
            auto& place = dynamic_cast<CKvrCBELocation&>(*item);
            place.radius = place.chainage * 2;
            place.width = place.chainage * 3;
        }
        return 1;
    };
    other->answer = [](WPARAM, CObList* objects) { return Give(objects, "FOREIGN", 1); };
    CObList places, whole;
    EXPECT_EQ(a->Ask(KsRequest::LoadLocations, &places), 1);
    ASSERT_EQ(places.size(), 3u);
    EXPECT_TRUE(std::isnan(PlaceAt(places, 1).radius));
    EXPECT_EQ(a->Ask(KsRequest::LoadLocationsAndChannel, &whole), 1);
    ASSERT_EQ(whole.size(), 3u);
    for (std::size_t i = 0; i < whole.size(); ++i) {
        EXPECT_EQ(PlaceAt(whole, i).radius, PlaceAt(whole, i).chainage * 2);
        EXPECT_EQ(PlaceAt(whole, i).width, PlaceAt(whole, i).chainage * 3);
    }
}

TEST_F(SwitchboardTest, TheFirstPickedPlaceCountsAndPartnersMayLeave)
{
    net->answer = sections->answer = [](WPARAM, CObList* objects) { return Give(objects, "MAIN", 10); };
    CObList places;
    EXPECT_EQ(a->Ask(KsRequest::FetchLocation, &places), 1);
    EXPECT_EQ(places.size(), 1u);
    EXPECT_TRUE(sections->heard.isEmpty());

    // One that closes because of the question does not stop the others from being asked.
    places.clear();
    b->answer = [this](WPARAM, CObList*) -> LRESULT {
        net->Ask(KsRequest::LeaveProject);
        net.reset();
        return 0;
    };
    EXPECT_EQ(a->Ask(KsRequest::LoadLocations, &places), 1);
    EXPECT_EQ(places.size(), 1u);
    sections.reset(); // without taking leave
    places.clear();
    b->answer = nullptr;
    EXPECT_EQ(a->Ask(KsRequest::LoadLocations, &places), 0);
}

TEST_F(SwitchboardTest, TheViewsOfTheProject)
{
    const auto views = [](Editor& asking) {
        CObList objects;
        EXPECT_EQ(asking.Ask(KsRequest::ProjectViews, &objects), 1);
        std::vector<CView*> found;
        for (const auto& item : objects)
            found.push_back(dynamic_cast<const CKvrCBEView&>(*item).view);
        return found;
    };
    EXPECT_EQ(views(*a), (std::vector<CView*>{b.get(), net.get(), sections.get()}));
    EXPECT_EQ(views(*c), std::vector<CView*>{other.get()});
    EXPECT_EQ(a->Ask(KsRequest::ProjectViews), 0);
    net->Ask(KsRequest::LeaveProject);
    EXPECT_EQ(views(*a).size(), 2u);
    projects.Close(c->project);
    EXPECT_TRUE(views(*c).empty());
}

} // namespace
