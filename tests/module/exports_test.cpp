// The plug-in as the shell sees it: loaded by name, reached through its exported functions alone.
#include "files/extensions.h"
#include "ks/fc/doc_template.h"
#include "ks/fc/frames.h"
#include "ks/fc/hd_messages.h"
#include "ks/fc/plugin.h"

#include <QLibrary>
#include <QProcess>
#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace {

class ExportsTest : public testing::Test
{
protected:
    template <typename Function>
    Function* Get(const char* name)
    {
        auto* function = reinterpret_cast<Function*>(library.resolve(name));
        EXPECT_NE(function, nullptr) << name << ": " << qPrintable(library.errorString());
        return function;
    }
    QLibrary library{QStringLiteral(KVR_PLUGIN)};
};

TEST_F(ExportsTest, AnswersAsTheShellExpects)
{
    EXPECT_EQ(Get<int()>("KsGetNumDocTemplates")(), 1);
    EXPECT_EQ(Get<int()>("KsGetNumToolbars")(), 1);
    EXPECT_EQ(Get<int()>("KsGetBitmapId")(), 4965);

    auto* editorString = Get<BOOL(CString*)>("KsGetEditorString");
    CString text;
    EXPECT_FALSE(editorString(nullptr));
    EXPECT_TRUE(editorString(&text));
    EXPECT_EQ(text, "HD Parameters");
    auto* toolbarString = Get<BOOL(CString*, int)>("KsGetToolbarString");
    EXPECT_FALSE(toolbarString(&text, 1));
    EXPECT_TRUE(toolbarString(&text, 0));
    EXPECT_EQ(text, " KVR HD Tools");

    auto* templatePtr = Get<CMultiDocTemplate*(int)>("KsGetDocTemplatePtr");
    EXPECT_EQ(templatePtr(1), nullptr);
    const std::unique_ptr<CMultiDocTemplate> first(templatePtr(0)), second(templatePtr(0));
    ASSERT_TRUE(first && second);
    EXPECT_NE(first, second);
    EXPECT_EQ(first->ResourceId(), 4953);
    EXPECT_EQ(first->GetDocString(CMultiDocTemplate::windowTitle), "Kvr_Help.chm");
    EXPECT_EQ(first->GetDocString(CMultiDocTemplate::filterExt), HDExtension) << "a text of its own";
    EXPECT_EQ(first->GetDocString(CMultiDocTemplate::regFileTypeName), "HDPar Document");
}

TEST_F(ExportsTest, BuildsItsToolBar)
{
    CKsMDIFrameWnd frame;
    auto* init = Get<BOOL(CKsToolBarEx*, CKsMDIFrameWnd*, unsigned, unsigned, unsigned)>("KsInitToolbar");
    auto* create = Get<CKsToolBarEx*(CKsMDIFrameWnd*, unsigned, unsigned, int)>("KsCreateToolbar");
    auto* bar = new CKsToolBarEx(&frame);
    EXPECT_FALSE(init(bar, &frame, 0, 1, 1));
    EXPECT_TRUE(bar->actions().isEmpty());
    EXPECT_TRUE(init(bar, &frame, 1, 1, 0));
    EXPECT_EQ(bar->actions().size(), 2);
    EXPECT_EQ(bar->GetBarStyle(), 0x35u);
    EXPECT_EQ(create(&frame, 0, 1, 1), nullptr);
    EXPECT_EQ(create(nullptr, 0, 1, 0), nullptr);
    EXPECT_NE(create(&frame, 0, 2, 0), nullptr);
}

TEST_F(ExportsTest, OtherEditorsFindTheirFunctions)
{
    QTemporaryDir folder;
    QFile file(folder.filePath("river.hdkv"));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.write("[KAVO0_HD]\n[WindList]\nDATA = \"MAIN\", 7, 1\n[/WindList]\n[/KAVO0_HD]\n");
    file.close();
    const std::unique_ptr<CObList> items(Get<decltype(KvrMSGGetData)>("KvrMSGGetData")(file.fileName(), nullptr));
    ASSERT_TRUE(items && items->size() == 1);
    EXPECT_EQ(dynamic_cast<const CKvr_CBE_ModelDataItem&>(*items->front()).branch, "MAIN")
        << "the items' types are known across libraries";
    EXPECT_EQ(Get<decltype(KvrMSGGetHDMaps)>("KvrMSGGetHDMaps")({}, nullptr), nullptr);
    Get<decltype(KvrMSGInsertData)>("KvrMSGInsertData")({}, nullptr, items.get());
}

TEST_F(ExportsTest, ExportsNothingElse)
{
#ifdef Q_OS_UNIX
    QProcess nm;
    nm.start("nm", {"-D", "--defined-only", KVR_PLUGIN});
    if (!nm.waitForFinished())
        GTEST_SKIP() << "no nm on this machine";
    QStringList names;
    for (const QByteArray& line : nm.readAllStandardOutput().split('\n')) {
        const QByteArray name = line.mid(line.lastIndexOf(' ') + 1);
        // Linkage that C++ requires to be shared (type information, inline statics) is marked weak or unique.
        if (line.contains(" T ") && !name.startsWith('_'))
            names << name;
    }
    names.sort();
    QStringList declared;
#define KVR_NAME(result, name, arguments) declared << #name;
    KS_PLUGIN_FUNCTIONS(KVR_NAME)
    KVR_HD_FUNCTIONS(KVR_NAME)
#undef KVR_NAME
    declared.sort();
    EXPECT_EQ(names, declared);
#endif
}

} // namespace
