// Memory ends at every place where the documents of the shell ask for it: the user is told, and document and file are
// what they were. Two things are left out: Qt's own strings and lists do not ask operator new, and end the program
// where they get nothing; its objects do not stand it, so that documents and windows are made whole.
#include "document/document.h"
#include "editors/cross_sections/document.h"
#include "editors/network/document.h"
#include "granted_memory.h"
#include "grid/vector_rows.h"
#include "ks/fc/doc_template.h"
#include "ks/fc/frames.h"
#include "ks/fc/message_box.h"
#include "shell/projects.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QUndoStack>
#include <filesystem>
#include <functional>
#include <gtest/gtest.h>

namespace {

/// Runs something with so much memory.
template <typename Work>
auto With(long grants, bool forGood, Work work)
{
    GrantedMemory::refused = false;
    GrantedMemory::refusesForGood = forGood;
    GrantedMemory::granted = grants;
    const auto result = work();
    GrantedMemory::granted = GrantedMemory::unlimited;
    return result;
}

class MemoryTest : public testing::Test
{
protected:
    MemoryTest()
    {
        KsSetMessageBoxHandler([this](const CString& text, QMessageBox::StandardButtons) {
            told += text;
            return QMessageBox::No;
        });
    }
    ~MemoryTest() override { KsSetMessageBoxHandler({}); }

    /// Goes on as long as memory ends: `step` does something once with that much of it.
    static long EveryPlace(const std::function<void(long grants, bool forGood)>& step)
    {
        long places = 0;
        for (const bool forGood : {false, true}) {
            GrantedMemory::refused = true;
            for (long place = 0; GrantedMemory::refused && !HasFailure(); ++place, ++places) {
                SCOPED_TRACE("place " + std::to_string(place) + (forGood ? " and on" : ""));
                step(place, forGood);
            }
        }
        return places;
    }

    /// Writes the file that the test begins with.
    void Write(const QString& name, const QByteArray& text)
    {
        path = folder.filePath(name);
        QFile file(path);
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(text);
        before = text;
    }
    QByteArray Content() const
    {
        QStringList names = QDir(folder.path()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot);
        names.removeIf([](const QString& name) { return name.endsWith(".lock"); }); // of the document that is open
        EXPECT_EQ(names.size(), 1) << names.join(u' ').toStdString();
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("(no file)");
    }
    bool IsToldOfMemory() const { return told.contains(u"memory"); }

    QTemporaryDir folder;
    QString path, told;
    QByteArray before;
};

struct Kind
{
    const char* name;
    std::function<CKsProjectDoc*()> make;
    QByteArray text, other; // of a file, and what it becomes
};

/// As a page does that shows a table of which a save writes a row that is not there.
void ShowTables(CKsProjectDoc& document)
{
    auto* const hd = qobject_cast<CKavo0_hdDoc*>(&document);
    if (!hd)
        return;
    auto& files = hd->Parameters().Global.TextOutput.OutputFiles;
    using File = std::remove_reference_t<decltype(files)>::value_type;
    const auto rows = std::make_shared<VectorRows<File>>(files, VectorOwner{}, WhenEmpty::OneRow);
    hd->AtSave({.rows = rows, .writesFirstRow = true});
}

// Without it, it is the time at which the file is read.
#define PERIOD                                                                                                         \
    "[TextOutput]\nLimitedPeriodStart = 2024, 5, 1, 12, 0, 0\nLimitedPeriodEnd = 2024, 6, 1, 12, 0, "                  \
    "0\n[/TextOutput]\n"

const Kind kinds[] = {
    {"a.HDKV", [] { return new CKavo0_hdDoc; },
     "[KAVO0_HD]\n[Global_Variables]\n" PERIOD
     "[/Global_Variables]\n[InitList]\nDATA = \"R\", 1, 2, 3\n[/InitList]\n[/KAVO0_HD]\n",
     "[KAVO0_HD]\n[Global_Variables]\n" PERIOD "[Heat_Balance]\nLatitude = 1\n[/Heat_Balance]\n[/Global_Variables]\n"
     "[InitList]\nDATA = \"\", 1, 2, 3\nDATA = \"a longer name of a river\", 2.5, 2, 3, 4\nMINE = 1\n[/InitList]\n"
     "[Other]\n[/Other]\n[/KAVO0_HD]\n"},
    {"a.kvnw", [] { return new CNetworkDoc; }, "[KVR_NETWORK]\n[/KVR_NETWORK]\n",
     "[KVR_NETWORK]\n[Branch]\nName = \"A\"\nChainage = 0, 10\nFlowsDownstream = true\n[Line]\nVertex = 0, 0\n"
     "Vertex = 1, 1\n[/Line]\n[Channel]\nDATA = 1, nan, 3\n[/Channel]\nMINE = 1\n[/Branch]\n[/KVR_NETWORK]\n"},
    {"a.kvxs", [] { return new CCrossSectionDoc; }, "[KVR_CROSS_SECTIONS]\n[/KVR_CROSS_SECTIONS]\n",
     "[KVR_CROSS_SECTIONS]\n[CrossSection]\nBranch = \"A\"\nTopoID = \"\"\nChainage = 1\nRadius = nan\nWidth = nan\n"
     "[Profile]\nPoint = 0, 1\nPoint = 1, 0\n[/Profile]\n[/CrossSection]\n[/KVR_CROSS_SECTIONS]\n"}};

} // namespace

TEST_F(MemoryTest, ADocumentIsOpenedWholeOrNot)
{
    for (const Kind& kind : kinds) {
        SCOPED_TRACE(kind.name);
        std::filesystem::remove(path.toStdString());
        Write(kind.name, kind.other);
        CKsMDIFrameWnd frame;
        const auto make = [&] {
            const long granted = std::exchange(GrantedMemory::granted, GrantedMemory::unlimited);
            CKsDoc* const document = kind.make();
            GrantedMemory::granted = granted;
            return document;
        };
        CMultiDocTemplate documents(1, "w\nd\nn\nf\n.x\ni\nt",
                                    {make,
                                     [] {
                                         GrantedMemory::granted = GrantedMemory::unlimited; // it is loaded
                                         return new CKsMDIChildWnd;
                                     },
                                     [] { return new CView; }});
        const auto open = [&] { return documents.OpenDocumentFile(&frame, path); };
        const auto close = [](CKsDoc* document) { delete CKsMDIChildWnd::Of(document->Views().front()); };
        CKsDoc* whole = open();
        ASSERT_NE(whole, nullptr);
        const std::string content = whole->ContentText().value();
        close(whole);
        EXPECT_GT(EveryPlace([&](long grants, bool forGood) {
                      told.clear();
                      if (auto* document = static_cast<CKsProjectDoc*>(With(grants, forGood, open))) {
                          if (document->File().IsUnreadable()) // it opens, read-only, and says so
                              EXPECT_TRUE(document->File().Error().contains(u"memory"));
                          else
                              EXPECT_EQ(document->ContentText().value(), content);
                          close(document);
                      } else {
                          EXPECT_TRUE(IsToldOfMemory()) << told.toStdString();
                      }
                      EXPECT_EQ(Content(), before);
                  }),
                  50);
    }
}

TEST_F(MemoryTest, ADocumentIsSavedOrStaysAsItIs)
{
    for (const Kind& kind : kinds) {
        SCOPED_TRACE(kind.name);
        std::filesystem::remove(path.toStdString());
        Write(kind.name, kind.text);
        std::unique_ptr<CKsProjectDoc> document;
        const auto open = [&] {
            document.reset(kind.make());
            EXPECT_TRUE(document->OnOpenDocument(path));
            document->SetPathName(path);
            ShowTables(*document);
        };
        open();
        bool isOther = false;
        const auto change = [&] {
            const QByteArray& text = (isOther = !isOther) ? kind.other : kind.text;
            return document->TakeContent(text.toStdString(), "step");
        };
        QByteArray saved[2]; // what a save writes of both
        for (int i = 0; i < 2; ++i) {
            ASSERT_TRUE(change() && document->DoSave(path));
            saved[isOther] = before = Content();
        }
        EXPECT_GT(EveryPlace([&](long grants, bool forGood) {
                      ASSERT_TRUE(document->IsModified() || change());
                      told.clear();
                      const std::string content = document->ContentText().value();
                      const int steps = document->UndoStack().count();
                      if (With(grants, forGood, [&] { return document->DoSave(path); })) {
                          EXPECT_FALSE(document->IsModified());
                          before = Content();
                          EXPECT_EQ(before, saved[isOther]);
                      } else {
                          EXPECT_TRUE(IsToldOfMemory()) << told.toStdString();
                          EXPECT_TRUE(document->IsModified());
                          EXPECT_EQ(document->UndoStack().count(), steps);
                          EXPECT_EQ(document->ContentText().value(), content);
                          EXPECT_EQ(Content(), before);
                      }
                  }),
                  60);
    }
}

TEST_F(MemoryTest, AProjectIsOpenedWholeOrNot)
{
    Write("a.kvrp", "[KVR_PROJECT]\n[Members]\nFile = <a.HDKV>\nFile = <a file of a longer "
                    "name.kvnw>\n[/Members]\n[/KVR_PROJECT]\n");
    CProjects projects;
    EXPECT_GT(EveryPlace([&](long grants, bool forGood) {
                  told.clear();
                  if (const CProject* project = With(grants, forGood, [&] { return projects.Open(path, told); })) {
                      EXPECT_EQ(project->members.size(), 2);
                      projects.Close(project->handle);
                  } else {
                      EXPECT_TRUE(IsToldOfMemory()) << told.toStdString();
                  }
                  EXPECT_EQ(Content(), before);
              }),
              20);
}
