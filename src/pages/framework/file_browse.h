// Choosing the file of a page: a function for the buttons of a grid, a field with a button of its own.
#pragma once

#include <QWidget>
#include <optional>

class CKavo0_hdDoc;
class QLineEdit;
class QToolButton;

/// What kind of file a page names.
struct FileKind
{
    QString extension;      // without its point
    bool isWritten = false; // by the simulation, which otherwise reads it
};

/// Asks for a file name, starting in the folder of the file named, or in the document's. Names in a document are
/// relative to its folder, or absolute. Asks before the name of another file is taken that would be written over, or
/// that is to be read and is not there. Nothing when the user cancelled or declined.
std::optional<QString> BrowseForFile(const CKavo0_hdDoc& document, const QString& current, const FileKind& kind,
                                     QWidget* parent);

/// A file name with a browse button.
class CGeoFileEdit : public QWidget
{
    Q_OBJECT
public:
    explicit CGeoFileEdit(QWidget* parent = nullptr);

    /// The document outlives the field.
    void SetUp(const CKavo0_hdDoc& document, FileKind kind);
    /// The names of its parts, in the user's language.
    void Retranslate();
    QLineEdit* Field() const { return m_field; }

signals:
    /// The user chose another file with the button; the field has its name.
    void Chosen();

private:
    void Browse();

    QLineEdit* m_field;    // child
    QToolButton* m_button; // child
    const CKavo0_hdDoc* m_document = nullptr;
    FileKind m_kind;
};
