// The pages in the program's smallest window, and beside the other editors of a project: nothing is cut off.
#include "ks/language/language.h"
#include "shell/main_frame.h"

#include <QDir>
#include <QMdiSubWindow>
#include <QScrollArea>
#include <QScrollBar>
#include <QSettings>
#include <QTabWidget>
#include <QTableView>
#include <QTemporaryDir>
#include <QTest>
#include <gtest/gtest.h>

namespace {

int Hidden(const QScrollBar* bar)
{
    return bar->maximum() - bar->minimum();
}

} // namespace

class RoomTest : public testing::TestWithParam<const char*>
{
protected:
    RoomTest()
    {
        QSettings().clear();
        KsLanguage::Instance().SetCurrent(QString::fromLatin1(GetParam()));
        KsLangLoadResDll("ks", nullptr, 0);
        KsLangLoadResDll("kvrshell", nullptr, 0);
        frame = std::make_unique<CMainFrame>();
        frame->LoadPlugins(QStringLiteral(KVR_BUILD_DIR "/bin/plugins"));
    }
    ~RoomTest() override
    {
        frame.reset();
        KsLanguage::Instance().SetCurrent(QStringLiteral("en_US"));
    }
    QTabWidget* Open(const char* file, QSize size)
    {
        frame->resize(size);
        frame->show();
        EXPECT_TRUE(QTest::qWaitForWindowActive(frame.get()));
        // A copy: a file that another program has open is told by a bar, which takes room.
        for (const QFileInfo& example :
             QDir(QStringLiteral(KVR_SOURCE_DIR "/examples/river")).entryInfoList(QDir::Files))
            EXPECT_TRUE(QFile::copy(example.filePath(), folder.filePath(example.fileName())));
        EXPECT_TRUE(frame->OpenFile(folder.filePath(file)));
        return frame->findChild<QTabWidget*>("sheet");
    }
    /// Brings each page to the front, as the keys do.
    template <typename Check>
    static void OnEveryPage(QTabWidget& sheet, Check check)
    {
        for (int tab = 0; tab < sheet.count(); ++tab) {
            sheet.setCurrentIndex(tab);
            QTest::qWait(20); // scroll bars come and go
            const auto* area = sheet.currentWidget()->findChild<QScrollArea*>();
            ASSERT_TRUE(area);
            SCOPED_TRACE(sheet.tabText(tab).toStdString());
            check(*area);
        }
    }

    QTemporaryDir folder;
    std::unique_ptr<CMainFrame> frame;
};

INSTANTIATE_TEST_SUITE_P(Languages, RoomTest, testing::Values("en_US", "ja"));

TEST_P(RoomTest, EveryPageFitsTheSmallestWindow)
{
    QTabWidget* sheet = Open("river.HDKV", {1000, 650});
    ASSERT_TRUE(sheet);
    EXPECT_EQ(sheet->count(), 22);
    OnEveryPage(*sheet, [](const QScrollArea& area) {
        const auto fits = [&area] { return !Hidden(area.horizontalScrollBar()) && !Hidden(area.verticalScrollBar()); };
        static_cast<void>(QTest::qWaitFor(fits, 5000)); // a busy machine lays out later
        EXPECT_EQ(Hidden(area.horizontalScrollBar()), 0);
        EXPECT_EQ(Hidden(area.verticalScrollBar()), 0);
        for (const QTableView* grid : area.findChildren<QTableView*>()) {
            if (!grid->isVisible())
                continue;
            const bool hasMany = grid->model()->columnCount() > 8; // set-ups and maps
            EXPECT_TRUE(hasMany || Hidden(grid->horizontalScrollBar()) == 0) << grid->objectName().toStdString();
            EXPECT_GE(grid->viewport()->height(), grid->rowHeight(0)) << grid->objectName().toStdString();
        }
    });
}

TEST_P(RoomTest, PagesFitBesideOtherEditorsAndStackWhatStandsBesideEachOther)
{
    QTabWidget* sheet = Open("river.kvrp", {1280, 800});
    ASSERT_TRUE(sheet);
    EXPECT_EQ(frame->MdiArea().subWindowList().size(), 3);
    OnEveryPage(*sheet, [](const QScrollArea& area) { EXPECT_EQ(Hidden(area.horizontalScrollBar()), 0); });
    // Their tables have room for lines; what the window has none for is scrolled to.
    for (const QMdiSubWindow* window : frame->MdiArea().subWindowList())
        for (const QTableView* table : window->findChildren<QTableView*>())
            if (!sheet->isAncestorOf(table)) {
                EXPECT_GE(table->viewport()->height(), 2 * table->rowHeight(0)) << table->objectName().toStdString();
                EXPECT_LE(table->width(), window->width()) << table->objectName().toStdString();
            }
    sheet->setCurrentIndex(12); // heat balance, whose page is not full: what the values mean is there whole
    int meanings = 0;
    for (const auto* widget : sheet->currentWidget()->findChildren<QWidget*>())
        if (QLatin1String(widget->metaObject()->className()) == QLatin1String("CFieldMeaning") && ++meanings) {
            const auto isWhole = [widget] { return widget->height() >= widget->sizeHint().height(); };
            EXPECT_TRUE(QTest::qWaitFor(isWhole, 2000)) << widget->accessibleName().toStdString();
        }
    EXPECT_GT(meanings, 5);
    const auto* settings = sheet->findChild<QWidget*>("textFile_1257");
    const auto* period = sheet->findChild<QWidget*>("period_1258");
    ASSERT_TRUE(settings && period);
    sheet->setCurrentIndex(14);
    ASSERT_TRUE(settings->isVisible());
    QMdiSubWindow* window = frame->MdiArea().activeSubWindow();
    for (const int width : {1000, 650, 1000}) {
        window->resize(width, 600);
        QTest::qWait(20);
        EXPECT_EQ(period->y() > settings->y(), width < 1000) << width;
        for (const auto* area : sheet->currentWidget()->findChildren<QScrollArea*>())
            EXPECT_EQ(Hidden(area->horizontalScrollBar()), 0) << width;
    }
}
