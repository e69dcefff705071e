#include "ks/fc/file_dialog.h"

#include <QApplication>
#include <QFileDialog>
#include <QFileInfo>
#include <utility>

static KsFileDialogHandler g_handler;

CString KsAskFileName(const KsFileQuestion& question, QWidget* parent)
{
    if (const auto handler = g_handler)
        return handler(question);
    const QFileInfo proposal(question.proposal);
    QFileDialog dialog(parent ? parent : QApplication::activeWindow(), question.title,
                       proposal.isDir() ? proposal.filePath() : proposal.path());
    dialog.setNameFilters(question.filters.split(QStringLiteral(";;"), Qt::SkipEmptyParts));
    dialog.setAcceptMode(question.save ? QFileDialog::AcceptSave : QFileDialog::AcceptOpen);
    dialog.setFileMode(question.save ? QFileDialog::AnyFile : QFileDialog::ExistingFile);
    dialog.setOption(QFileDialog::DontConfirmOverwrite);
    if (question.extension.startsWith(u'.'))
        dialog.setDefaultSuffix(question.extension.mid(1));
    if (question.save && !proposal.isDir())
        dialog.selectFile(proposal.fileName());
    return dialog.exec() == QDialog::Accepted ? dialog.selectedFiles().value(0) : CString();
}

KsFileDialogHandler KsSetFileDialogHandler(KsFileDialogHandler handler)
{
    return std::exchange(g_handler, std::move(handler));
}
