// What the help command shows on a page.
#pragma once

#include <QString>

/// The keys of the fields and, on a page that has them, of the tables, as rich text in the user's language.
QString PageHelpText(bool hasTables);
