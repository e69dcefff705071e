#include "pages/framework/file_browse.h"

#include "document/document.h"
#include "ks/fc/file_dialog.h"
#include "ks/fc/message_box.h"
#include "pages/framework/binding.h"
#include "res/strings.h"

#include <QDir>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QLineEdit>
#include <QToolButton>

std::optional<QString> BrowseForFile(const CKavo0_hdDoc& document, const QString& current, const FileKind& kind,
                                     QWidget* parent)
{
    const QDir home = document.GetPathName().isEmpty() ? QDir::home() : QFileInfo(document.GetPathName()).absoluteDir();
    const QFileInfo named(home, current);
    const bool isReadable = !current.isEmpty() && named.isFile() && named.isReadable();
    const QDir folder = !current.isEmpty() && named.dir().exists() ? named.dir() : home;

    KsFileQuestion question;
    question.save = true;
    question.title = LoadString(Str::BrowseTitle);
    question.extension = u'.' + kind.extension;
    question.filters = QStringLiteral("(*.%1)").arg(kind.extension);
    question.proposal = folder.filePath(isReadable ? named.fileName() : question.extension);
    const QString chosen = KsAskFileName(question, parent);
    if (chosen.isEmpty())
        return std::nullopt;
    const QString name = QDir::toNativeSeparators(chosen);
    const bool isOther = !isReadable || QFileInfo(chosen) != named;
    const bool isDoubtful = isOther && QFileInfo::exists(chosen) == kind.isWritten;
    const Str doubt = kind.isWritten ? Str::FileIsWritten : Str::FileIsMissing;
    if (isDoubtful &&
        KsMessageBox(LoadString(doubt).arg(name), QMessageBox::Yes | QMessageBox::No, parent) != QMessageBox::Yes)
        return std::nullopt;
    return name;
}

CGeoFileEdit::CGeoFileEdit(QWidget* parent)
    : QWidget(parent), m_field(new QLineEdit(this)), m_button(new QToolButton(this))
{
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_field);
    layout->addWidget(m_button);
    setFocusProxy(m_field);
    m_button->setText(QStringLiteral("..."));
    connect(m_button, &QToolButton::clicked, this, &CGeoFileEdit::Browse);
}

void CGeoFileEdit::SetUp(const CKavo0_hdDoc& document, FileKind kind)
{
    m_document = &document;
    m_kind = std::move(kind);
}

void CGeoFileEdit::Browse()
{
    if (m_field->isReadOnly())
        return;
    if (const auto chosen = BrowseForFile(*m_document, m_field->text(), m_kind, this)) {
        m_field->setText(*chosen);
        emit Chosen();
    }
}

void CGeoFileEdit::Retranslate()
{
    SetAccessibleName(*m_field, LoadString(Str::FileName));
    SetAccessibleName(*m_button, LoadString(Str::BrowseTitle));
    m_button->setToolTip(LoadString(Str::BrowseTitle));
}
