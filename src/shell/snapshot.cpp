#include "shell/snapshot.h"

#include "files/file_content.h"
#include "ks/fc/doc.h"
#include "ks/fc/doc_template.h"
#include "ks/fc/typed_text.h"
#include "shell/recovery_file.h"
#include "shell/recovery_folder.h"

#include <QFile>
#include <QSocketNotifier>
#include <QUndoStack>
#include <new>
#include <utility>

namespace {

/// In the copy of the process: whose changes these are, and what they come to.
std::error_code WriteContent(CKsDoc& document, CRecoveryHeader header, const QString& file)
{
    if (ProcessCopy::IsThis())
        header.typed = CKsTypedText::EnterIn(document);
    const Result<std::string> content = document.ContentText();
    if (!content)
        return content.error().code ? content.error().code : std::make_error_code(std::errc::invalid_argument);
    const FileStatus known = document.Seen();
    if (known.kind == FileStatus::Kind::File && StatusBehind(header.path.toStdString()).IsUnchanged(known)) {
        header.size = qint64(known.size);
        header.hash = FileHash(header.path);
    }
    return WriteRecoveryFile(file, header, content.value());
}

} // namespace

CSnapshot::CSnapshot(CKsDoc& document, CRecoveryFolder& folder, std::chrono::milliseconds delay)
    : m_document(document), m_folder(folder), m_delay(delay)
{
    m_timer.setSingleShot(true);
    m_look.start(delay);
    connect(&m_look, &QTimer::timeout, this, &CSnapshot::LookAtTyping);
    connect(&m_timer, &QTimer::timeout, this, &CSnapshot::Write);
    connect(&document.UndoStack(), &QUndoStack::indexChanged, this, &CSnapshot::StepMade);
    connect(&document, &CKsDoc::TitleChanged, this, &CSnapshot::StateChanged);
    connect(&document, &CKsDoc::FileGoneChanged, this, &CSnapshot::StateChanged);
}

CSnapshot::~CSnapshot()
{
    blockSignals(true); // there is nothing to ask it any more
    Drop();
    FinishWriter();
}

void CSnapshot::Continue(const QString& file)
{
    if (m_file == file)
        return;
    const int steps = m_steps;
    Drop();
    FinishWriter();
    m_file = file;
    m_steps = steps;
    if (m_steps > 0)
        m_timer.start(m_delay);
}

void CSnapshot::StepMade()
{
    if (m_document.UndoStack().isClean() && !m_document.IsFileGone())
        return;
    if (++m_steps >= Steps && !m_failure)
        Write();
    else if (!m_timer.isActive())
        m_timer.start(m_delay);
}

void CSnapshot::StateChanged()
{
    if (!m_document.IsUnsaved())
        return Drop();
    // A file that is gone makes what is shown one more state that has to be kept, though nobody has made a step.
    const bool isKept = !m_file.isEmpty() && !m_isDropped;
    if (m_document.IsFileGone() && !isKept && !m_timer.isActive()) {
        ++m_steps;
        m_timer.start(m_delay);
    }
}

/// Nobody says that somebody types, and nothing is changed by it.
void CSnapshot::LookAtTyping()
{
    const QStringList typed = CKsTypedText::Of(m_document);
    const bool isNothing = typed.isEmpty() && !m_document.IsUnsaved();
    if (typed == m_typed && !(isNothing && m_failure))
        return;
    if (isNothing)
        Drop(); // it was taken back, also what could not be kept
    else
        Write();
}

void CSnapshot::Write()
{
    m_timer.stop();
    if (m_writer)
        return;                     // what is due then is seen when it has ended
    if (m_document.IsExecuting()) { // a save has taken out of the document what it does not write
        constexpr std::chrono::milliseconds pause{200};
        m_timer.start(pause);
        return;
    }
    std::error_code failure;
    try {
        failure = StartWriter();
    } catch (const std::bad_alloc&) {
        failure = std::make_error_code(std::errc::not_enough_memory);
    }
    if (failure)
        Fail(failure);
}

std::error_code CSnapshot::StartWriter()
{
    if (m_file.isEmpty()) {
        Result<QString> file = m_folder.NewFile();
        if (!file)
            return file.error().code;
        m_file = std::move(file.value());
    } else if (const Result<void> secured = m_folder.Secure(m_file); !secured) {
        return secured.error().code;
    }
    // What was recovered beside its file is that file's changes until it has one of its own.
    const QString& path = m_document.GetPathName();
    const CRecoveryHeader header{.path = path.isEmpty() ? m_document.StandsBeside() : path,
                                 .extension = m_document.GetDocTemplate()->GetDocString(CMultiDocTemplate::filterExt),
                                 .title = m_document.GetTitle(),
                                 .time = QDateTime::currentDateTimeUtc(),
                                 .dateOfFile = m_document.DateOfFile()};
    QStringList typed = CKsTypedText::Of(m_document);
    Result<ProcessCopy> writer = ProcessCopy::Start([&] { return WriteContent(m_document, header, m_file); });
    if (!writer)
        return writer.error().code;
    m_steps = 0;
    m_typed = std::move(typed);
    m_writer = std::move(writer.value());
    m_folder.WriterStarts();
    if (m_writer->Ended() == -1) {
        WriterEnded();
        return {};
    }
    m_writerEnds = std::make_unique<QSocketNotifier>(m_writer->Ended(), QSocketNotifier::Read);
    connect(m_writerEnds.get(), &QSocketNotifier::activated, this, &CSnapshot::WriterEnded);
    return {};
}

void CSnapshot::WriterEnded()
{
    if (m_writerEnds) {
        m_writerEnds->setEnabled(false);       // before what it looks at is closed
        m_writerEnds.release()->deleteLater(); // it is what calls
    }
    const std::error_code answer = m_writer->Wait().error;
    m_writer.reset();
    const bool isDropped = std::exchange(m_isDropped, false);
    m_folder.WriterEnds(isDropped || answer);
    if (isDropped)
        QFile::remove(std::exchange(m_file, QString())); // it may have come nevertheless
    else if (answer) {
        Fail(answer);
        return;
    }
    SetFailure({});
    if (m_steps >= Steps)
        Write();
    else if (m_steps > 0 && !m_timer.isActive())
        m_timer.start(m_delay);
}

/// The file is as far behind as before. It is tried again; not of an editor that has no part in this.
void CSnapshot::Fail(std::error_code why)
{
    if (why == std::errc::operation_not_supported) {
        m_document.disconnect(this);
        m_document.UndoStack().disconnect(this);
        m_look.stop();
        Drop();
        return;
    }
    m_timer.start(m_delay);
    SetFailure(why);
}

void CSnapshot::SetFailure(std::error_code why)
{
    if (std::exchange(m_failure, why) != why)
        emit FailureChanged();
}

/// Nothing is left to save, or nobody wants it. The end of a writer is not waited for: the system takes its time for
/// it.
void CSnapshot::Drop()
{
    m_timer.stop();
    m_steps = 0;
    m_typed.clear();
    if (!m_file.isEmpty())
        QFile::remove(m_file);
    if (m_writer) {
        m_writer->Stop();
        m_isDropped = true;
    } else {
        m_file.clear();
    }
    SetFailure({});
}

/// Only then nothing of it comes any more.
void CSnapshot::FinishWriter()
{
    m_writerEnds.reset();
    if (m_writer)
        WriterEnded();
}
