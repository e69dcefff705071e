// The plug-in itself.
#include "network_fixture.h"

TEST_F(NetworkTest, ThePluginOffersItsTemplateNameAndToolBar)
{
    CheckPlugin("river.KVNW", "KVR River Network (*.kvnw *.KVNW)", "River Network", "KVR Network Tools");
}
