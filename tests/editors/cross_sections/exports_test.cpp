// The plug-in itself.
#include "cross_sections_fixture.h"

TEST_F(CrossSectionTest, ThePluginOffersItsTemplateNameAndToolBar)
{
    CheckPlugin("river.KVXS", "KVR Cross Sections (*.kvxs *.KVXS)", "Cross Sections", "KVR Cross Section Tools");
}
