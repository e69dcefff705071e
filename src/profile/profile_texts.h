// The texts of the long profile, in the user's language.
#pragma once

#include <QCoreApplication>

class ProfileTexts
{
    Q_DECLARE_TR_FUNCTIONS(ProfileTexts)
public:
    /// Makes the translations available; the editor does so when it is loaded.
    static void Load();
};
