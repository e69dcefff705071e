// The tables of the dialog that shows what a paste would do.
#pragma once

#include "grid/paste_plan.h"

#include <QAbstractTableModel>
#include <functional>
#include <memory>
#include <set>

/// The lines as they are understood, under the columns that they go to. Rows and plan outlive it; the plan may be
/// another one from time to time, or none.
class CUnderstoodModel : public QAbstractTableModel
{
public:
    CUnderstoodModel(const CTableRows& rows, const std::unique_ptr<CPastePlan>& plan) : m_rows(rows), m_plan(plan) {}

    /// Another plan.
    void Renew();
    int rowCount(const QModelIndex& parent) const override;
    int columnCount(const QModelIndex& parent) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

private:
    int Target(int column) const { return m_plan->Choice().columns[std::size_t(column)].target; }

    const CTableRows& m_rows;
    const std::unique_ptr<CPastePlan>& m_plan;
    std::set<std::pair<std::size_t, int>> m_faulty{};
};

/// What does not fit, with the reasons; the texts can be mended.
class CFaultModel : public QAbstractTableModel
{
public:
    enum Column
    {
        Line,
        Name,
        Text,
        Reason,
        Count
    };
    using Mend = std::function<void(int fault, const QString& text)>; // which of the plan's
    CFaultModel(const CTableRows& rows, const std::unique_ptr<CPastePlan>& plan, Mend mend)
        : m_rows(rows), m_plan(plan), m_mend(std::move(mend))
    {
    }

    void Renew();
    int rowCount(const QModelIndex& parent) const override;
    int columnCount(const QModelIndex& parent) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    Qt::ItemFlags flags(const QModelIndex& index) const override;
    bool setData(const QModelIndex& index, const QVariant& value, int role) override;

private:
    const CPastePlan::Fault& FaultAt(const QModelIndex& index) const
    {
        return m_plan->Faults()[std::size_t(index.row())];
    }

    const CTableRows& m_rows;
    const std::unique_ptr<CPastePlan>& m_plan;
    Mend m_mend;
};
