// The translations are those of the texts in the sources: none is missing, none is left over, and each can be filled
// with what its source is filled with.
#include <QDir>
#include <QFile>
#include <QProcess>
#include <QRegularExpression>
#include <QTemporaryDir>
#include <QXmlStreamReader>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <ostream>
#include <map>

using testing::IsEmpty;

namespace {

/// What translates one module, as the build knows it.
struct Module
{
    std::string name;
    QStringList files, folders;

    /// In the lists of tests.
    friend std::ostream& operator<<(std::ostream& out, const Module& module) { return out << module.name; }
};

std::vector<Module> Modules()
{
    std::vector<Module> modules;
    QFile list(QStringLiteral(KVR_BUILD_DIR "/translations.txt"));
    if (!list.open(QIODevice::ReadOnly))
        return modules;
    for (const QString& line : QString::fromUtf8(list.readAll()).split(u'\n', Qt::SkipEmptyParts)) {
        const QStringList parts = line.split(u'|');
        modules.push_back({parts.at(0).toStdString(), parts.at(1).split(u';'), parts.at(2).split(u';')});
    }
    return modules;
}

/// A message of a *.ts file.
struct Message
{
    QString translation, state; // the state is "unfinished", "vanished" or empty
};
using Messages = std::map<QString, Message>; // by context and source

std::string Name(const QString& key)
{
    return key.toStdString();
}

Messages Read(const QString& path)
{
    Messages messages;
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << path.toStdString();
    QXmlStreamReader xml(&file);
    QString context, source;
    while (!xml.atEnd()) {
        if (xml.readNext() != QXmlStreamReader::StartElement)
            continue;
        if (xml.name() == u"name")
            context = xml.readElementText();
        else if (xml.name() == u"source")
            source = xml.readElementText();
        else if (xml.name() == u"translation") {
            const QString state = xml.attributes().value("type").toString();
            messages[context + ": " + source] = {xml.readElementText(), state};
        }
    }
    EXPECT_FALSE(xml.hasError()) << path.toStdString() << ": " << xml.errorString().toStdString();
    return messages;
}

/// The places that the program fills, line breaks and, by their number, mnemonics; sorted.
QStringList Placeholders(const QString& text)
{
    static const QRegularExpression places("%L?[0-9n]|\n|&(?=[A-Za-z0-9])");
    QStringList found;
    for (auto match = places.globalMatch(text); match.hasNext();)
        found << match.next().captured();
    found.sort();
    return found;
}

class Translations : public testing::TestWithParam<Module>
{
protected:
    /// The Japanese file as the sources would have it; what no source has any more is marked.
    Messages Refreshed(const QString& file)
    {
        const QString copy = QDir(m_folder.path()).filePath(QFileInfo(file).fileName());
        EXPECT_TRUE(QFile::copy(file, copy));
        QProcess update;
        update.start(QStringLiteral(KVR_LUPDATE),
                     QString(KVR_LUPDATE_OPTIONS).split(u'|') + GetParam().folders + QStringList{"-ts", copy});
        EXPECT_TRUE(update.waitForFinished(60000));
        EXPECT_EQ(update.exitCode(), 0);
        EXPECT_EQ(update.readAllStandardError().toStdString(), "") << "texts of a context that nobody can tell";
        return Read(copy);
    }
    /// Empty when the module has no such file.
    QString FileOf(const QString& language) const { return GetParam().files.filter("_" + language + ".ts").value(0); }

private:
    QTemporaryDir m_folder;
};

} // namespace

TEST_P(Translations, JapaneseHasEveryTextAndNoOther)
{
    std::vector<std::string> missing, unused;
    const auto messages = Refreshed(FileOf("ja"));
    for (const auto& [key, message] : messages) {
        if (message.state == u"vanished" || message.state == u"obsolete")
            unused.push_back(Name(key));
        else if (!message.state.isEmpty() || message.translation.isEmpty())
            missing.push_back(Name(key));
    }
    EXPECT_THAT(missing, IsEmpty()) << "run update_translations and translate them";
    EXPECT_THAT(unused, IsEmpty()) << "run update_translations";
    EXPECT_FALSE(messages.empty());
}

TEST_P(Translations, BritishHasOnlyWhatDiffers)
{
    const QString british = FileOf("en_GB");
    if (british.isEmpty())
        return;
    const auto known = Read(FileOf("ja"));
    for (const auto& [key, message] : Read(british)) {
        EXPECT_TRUE(known.count(key)) << Name(key) << " is in no source";
        EXPECT_FALSE(key.endsWith(": " + message.translation)) << Name(key) << " is in the sources already";
    }
}

TEST_P(Translations, EachTakesWhatItsSourceTakes)
{
    for (const QString& file : GetParam().files) {
        for (const auto& [key, message] : Read(file))
            EXPECT_EQ(Placeholders(key), Placeholders(message.translation)) << Name(key);
    }
}

INSTANTIATE_TEST_SUITE_P(Modules, Translations, testing::ValuesIn(Modules()),
                         [](const auto& module) { return module.param.name; });

TEST(TranslationsOfTheBuild, EveryModuleIsLookedAt)
{
    EXPECT_GE(Modules().size(), 5u);
}
