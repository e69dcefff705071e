#include "problems/problems_model.h"

#include "ks/fc/frames.h"
#include "ks/fc/shown_text.h"
#include "problems/problem_check.h"
#include "problems/problem_texts.h"

#include <algorithm>
#include <iterator>

CProblemsModel& CProblemsModel::In(CKsMDIFrameWnd& frame)
{
    auto* model = frame.findChild<CProblemsModel*>(QString(), Qt::FindDirectChildrenOnly);
    if (!model)
        model = new CProblemsModel(&frame);
    return *model;
}

void CProblemsModel::Add(CProblemCheck& check)
{
    m_checks.push_back(&check);
    connect(&check, &CProblemCheck::Changed, this, [this, &check] { Take(check); });
    connect(&check, &CProblemCheck::Ends, this, [this, &check] { Drop(&check); });
    Take(check);
}

void CProblemsModel::Drop(const CProblemCheck* check)
{
    std::erase(m_checks, check);
    const auto isOf = [check](const Row& row) { return row.check == check; };
    const auto first = std::ranges::find_if(m_rows, isOf);
    const auto last = std::find_if_not(first, m_rows.end(), isOf);
    if (first == last)
        return;
    beginRemoveRows({}, int(first - m_rows.begin()), int(last - m_rows.begin()) - 1);
    m_rows.erase(first, last);
    endRemoveRows();
    emit Counted();
}

std::vector<CProblemsModel::Row> CProblemsModel::RowsOf(CProblemCheck& check)
{
    std::vector<Row> rows;
    for (const FileProblem& problem : check.OfFile())
        rows.push_back({&check, problem.rule, {}, problem.where, problem.text});
    const auto where = check.Host().WhereAre(check.Found());
    for (std::size_t i = 0; i < where.size(); ++i)
        rows.push_back({&check, check.Found()[i].rule, check.Found()[i], where[i], {}});
    return rows;
}

/// What stays where it was keeps its row, so that a list that is being looked at does not jump.
void CProblemsModel::Take(CProblemCheck& check)
{
    const auto isOf = [&check](const Row& row) { return row.check == &check; };
    const auto first = std::ranges::find_if(m_rows, isOf);
    const std::ptrdiff_t at = first - m_rows.begin(), had = std::find_if_not(first, m_rows.end(), isOf) - first;
    std::vector<Row> rows = RowsOf(check);
    const std::ptrdiff_t has = std::ptrdiff_t(rows.size()), kept = std::min(had, has), end = at + kept;
    std::move(rows.begin(), rows.begin() + kept, m_rows.begin() + at);
    if (kept > 0)
        emit dataChanged(index(int(at), 0), index(int(end) - 1, Columns - 1));
    if (had > kept) {
        beginRemoveRows({}, int(end), int(at + had) - 1);
        m_rows.erase(m_rows.begin() + end, m_rows.begin() + at + had);
        endRemoveRows();
    } else if (has > kept) {
        beginInsertRows({}, int(end), int(at + has) - 1);
        m_rows.insert(m_rows.begin() + end, std::make_move_iterator(rows.begin() + kept),
                      std::make_move_iterator(rows.end()));
        endInsertRows();
    }
    emit Counted();
}

std::size_t CProblemsModel::Count(Severity severity) const
{
    std::size_t count = 0;
    for (const CProblemCheck* check : m_checks)
        count += check->Count(severity);
    return count;
}

void CProblemsModel::Retranslate()
{
    for (CProblemCheck* check : m_checks)
        Take(*check);
    emit headerDataChanged(Qt::Horizontal, 0, Columns - 1);
}

QString CProblemsModel::Text(const Row& row, int column) const
{
    switch (column) {
    case What:
        return row.problem ? ProblemTexts::TextOf(*row.problem) : row.text;
    case Page:
        return row.where.page;
    case Line:
        return row.where.line;
    case FieldName:
        return row.where.field;
    case Document:
        return row.check->Host().CheckedTitle();
    default:
        return QString::fromLatin1(RuleOf(row.rule).code);
    }
}

QVariant CProblemsModel::data(const QModelIndex& index, int role) const
{
    if (!index.isValid())
        return {};
    const Row& row = At(index.row());
    const Severity severity = RuleOf(row.rule).severity;
    switch (role) {
    case Qt::DisplayRole:
    case Qt::ToolTipRole:
        return KsVisibleText(Text(row, index.column()));
    case Qt::DecorationRole:
        return index.column() == What ? QVariant(ProblemTexts::IconOf(severity)) : QVariant();
    case Qt::AccessibleDescriptionRole:
        return ProblemTexts::NameOf(severity);
    case Qt::TextAlignmentRole:
        return index.column() == Line ? int(Qt::AlignRight | Qt::AlignVCenter) : QVariant();
    case SeverityRole:
        return int(severity);
    case SortRole:
        switch (index.column()) {
        case What: // the worst first, each as the file has them
            return qlonglong(severity) * rowCount() + index.row();
        case Line:
            return row.where.line.toLongLong();
        case Page: // as the tabs stand
            return qlonglong(row.where.tab) * rowCount() + index.row();
        default:
            return Text(row, index.column()).toCaseFolded();
        }
    default:
        return {};
    }
}

QVariant CProblemsModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole)
        return QAbstractTableModel::headerData(section, orientation, role);
    switch (section) {
    case What:
        return ProblemTexts::tr("Problem");
    case Page:
        return ProblemTexts::tr("Page");
    case Line:
        return ProblemTexts::tr("Line");
    case FieldName:
        return ProblemTexts::tr("Field");
    case Document:
        return ProblemTexts::tr("Document");
    default:
        return ProblemTexts::tr("Code");
    }
}
