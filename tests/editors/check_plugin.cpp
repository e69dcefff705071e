#include "editors/editor_fixture.h"
#include "ks/fc/plugin.h"
#include "ks/language/language.h"

#include <QLibrary>

void EditorTest::CheckPlugin(const char* file, const char* filter, const char* editor, const char* toolBar)
{
    QLibrary library(KVR_PLUGIN);
    ASSERT_TRUE(library.load()) << library.errorString().toStdString();
#define RESOLVE(result, name, arguments)                                                                               \
    const auto name = reinterpret_cast<result(*) arguments>(library.resolve(#name));                                   \
    ASSERT_TRUE(name) << #name;
    KS_PLUGIN_FUNCTIONS(RESOLVE)
#undef RESOLVE
    ASSERT_EQ(KsGetNumDocTemplates(), 1);
    const std::unique_ptr<CMultiDocTemplate> first(KsGetDocTemplatePtr(0)), second(KsGetDocTemplatePtr(0));
    EXPECT_NE(first, second);
    EXPECT_EQ(KsGetDocTemplatePtr(1), nullptr);
    EXPECT_TRUE(first->MatchesExtension(file));
    EXPECT_EQ(first->FileDialogFilter(), filter);
    const CString english = first->GetDocString(CMultiDocTemplate::fileNewName);
    KsLanguage::Instance().SetCurrent("ja");
    EXPECT_NE(first->FileDialogFilter(), filter) << "in the language of the moment";
    EXPECT_NE(first->GetDocString(CMultiDocTemplate::fileNewName), english);
    KsLanguage::Instance().SetCurrent("en_US");
    EXPECT_EQ(first->FileDialogFilter(), filter);
    CString name;
    EXPECT_TRUE(KsGetEditorString(&name));
    EXPECT_EQ(name, editor);
    EXPECT_FALSE(KsGetEditorString(nullptr));
    EXPECT_FALSE(KsGetToolbarString(&name, 1));
    EXPECT_TRUE(QFile::exists(KsBitmapPath(KsGetBitmapId())));

    CKsMDIFrameWnd window;
    EXPECT_EQ(KsCreateToolbar(&window, 0, 1, 1), nullptr);
    EXPECT_EQ(KsCreateToolbar(nullptr, 0, 1, 0), nullptr);
    CKsToolBarEx* bar = KsCreateToolbar(&window, 0, 1, 0);
    ASSERT_NE(bar, nullptr);
    EXPECT_EQ(bar->windowTitle(), toolBar);
    EXPECT_FALSE(bar->actions().isEmpty());
    for (const QAction* action : bar->actions()) {
        if (action->isSeparator())
            continue;
        EXPECT_FALSE(action->icon().isNull());
        EXPECT_FALSE(action->text().isEmpty());
        EXPECT_FALSE(action->isEnabled()); // nothing is shown that it could work on
    }
}
