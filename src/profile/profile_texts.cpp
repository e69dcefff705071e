#include "profile/profile_texts.h"

#include "ks/language/language.h"

void ProfileTexts::Load()
{
    KsLangLoadResDll("Kvr_profile", nullptr, 0); // by name: editors share them, and none gives them back
}
