// What the tables beside the maps and plots of the editors do alike.
#pragma once

#include <QAbstractTableModel>
#include <vector>

/// Rows follow a document; a change that cannot be made is refused with a message.
class CLinesTable : public QAbstractTableModel
{
    Q_OBJECT
public:
    int rowCount(const QModelIndex& parent = {}) const override;
    /// Shows the document's present state.
    void Reload();
    virtual void RemoveLines(const std::vector<int>& rows) = 0;

signals:
    /// For the user: where, what was expected and what was typed.
    void Refused(const QString& message);

protected:
    using QAbstractTableModel::QAbstractTableModel;
    /// How many the document has now.
    virtual int Lines() const = 0;
    /// Tells why a cell does not take what was typed; always false.
    bool Refuse(const QModelIndex& index, const QString& message);

private:
    int m_rows = 0;
};
