// What others have to say about lines of a table: an icon beside the number, and a text.
#pragma once

#include <QIcon>
#include <QStringList>
#include <unordered_map>

struct LineNote
{
    int weight = 0; // of the icon; the least is the one that shows
    QIcon icon;
    QStringList texts;

    void Add(int itsWeight, const QIcon& itsIcon, const QString& text)
    {
        if (texts.isEmpty() || itsWeight < weight) {
            weight = itsWeight;
            icon = itsIcon;
        }
        if (!texts.contains(text))
            texts << text;
    }
};

/// By the place of the line in its source.
using LineNotes = std::unordered_map<std::size_t, LineNote>;
