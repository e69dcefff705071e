// "Encroachment": set-ups of narrowed flood plains, each a list of locations.
#include "ks/fc/doc_command.h"
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "ui_encroach_page.h"

#include <QUndoStack>

namespace {

constexpr std::size_t NewSetupLines = 2; // a set-up is saved when its second line is filled

enum Method
{
    FixedPositions = 1,
    FixedWidth,
    ConveyanceReduction,
    TargetLevel,
    TargetLevelAndEnergy
};
enum Reduction
{
    BankByBank = 3
};

/// Whether the method of a line uses one of its values. Choices that nobody knows may use anything.
bool IsUsed(const void* value, const HDEncroach& line)
{
    const auto isOneOf = [value](const auto&... members) { return (... || (value == &members)); };
    const std::int32_t method = line.EncOption1;
    const bool isKnown = method >= FixedPositions && method <= TargetLevelAndEnergy;
    if (!isKnown || isOneOf(line.EncOption1, line.EncOption2))
        return true;
    if (isOneOf(line.EncValues1[0], line.EncValues1[1])) // offsets
        return method != FixedPositions;
    if (isOneOf(line.EncValues1[2], line.EncValues1[3])) // positions
        return method == FixedPositions;
    if (isOneOf(line.EncValues1[4])) // width
        return method == FixedWidth;
    if (isOneOf(line.EncOption3)) // how a reduction is shared
        return method >= ConveyanceReduction;
    if (isOneOf(line.EncValues2[0])) // total reduction
        return method == ConveyanceReduction && line.EncOption3 != BankByBank;
    if (isOneOf(line.EncValues2[1], line.EncValues2[2])) // of the banks
        return method == ConveyanceReduction && (line.EncOption3 < 1 || line.EncOption3 >= BankByBank);
    return method == TargetLevelAndEnergy || (method == TargetLevel && isOneOf(line.EncValues2[3]));
}

/// A set-up comes, or goes.
class CSetupComes : public KsLineChange
{
public:
    CSetupComes(const CGenList* lines, bool comes) : m_lines(lines), m_comes(comes) {}
    void TakeBack(KsTracedLine& line, bool forward) const override
    {
        if (line.data == m_lines && forward == m_comes)
            line.origin = KsLineOrigin::New;
    }

private:
    const CGenList* m_lines;
    bool m_comes; // when the step is made
};

/// A set-up more, or one less.
class CSetupCommand : public CDocumentCommand
{
public:
    /// Puts `setup` in at `index`; null takes the set-up out that stands there.
    CSetupCommand(CKavo0_hdDoc& document, std::size_t index, std::unique_ptr<CGenParamList<HDEncroach>> setup)
        : CDocumentCommand(document, LoadString(setup ? Str::UndoAddSetup : Str::UndoDeleteSetup)),
          m_setups(document.Parameters().EncroachList),
          m_index(index),
          m_setup(std::move(setup)),
          m_change(std::make_shared<CSetupComes>(m_setup ? m_setup.get() : &m_setups.GetAt(index), bool(m_setup)))
    {
    }

protected:
    ChangePlace Apply() override { return Exchange(); }
    ChangePlace Revert() override { return Exchange(); }
    std::shared_ptr<const KsLineChange> LineChange() const override { return m_change; }

private:
    ChangePlace Exchange()
    {
        if (m_setup)
            m_setups.InsertAt(m_index, std::move(m_setup));
        else
            m_setup = m_setups.RemoveAt(m_index);
        if (m_setups.IsEmpty())
            return {&m_setups};
        CGenList& shown = m_setups.GetAt(std::min(m_index, m_setups.GetCount() - 1));
        return {&shown, 1, 1, &shown, 1};
    }

    CGenMetaList<HDEncroach>& m_setups;
    std::size_t m_index;
    std::unique_ptr<CGenParamList<HDEncroach>> m_setup; // while it is out of the document
    std::shared_ptr<const KsLineChange> m_change;
};

class CEncroachPage : public CDialogPage<Ui::CEncroachPage, CLocationPage>
{
public:
    explicit CEncroachPage(CKavo0_hdDoc* document);
    void LoadFromDocument(CKavo0_hdDoc* document) override;
    bool Shows(const ChangePlace& place) const override;
    void Reveal(const ChangePlace& place, bool focus) override;

private:
    using Setup = CGenParamList<HDEncroach>;
    CGenMetaList<HDEncroach>& Setups() const;
    std::size_t SetupOf(const void* list) const;
    bool HasSetup() const { return m_current < Setups().GetCount(); }

    void DeclareColumns();
    /// Stores what is being edited and shows another set-up.
    void GoTo(std::size_t setup);
    /// Puts a new set-up behind the current one.
    void Insert(std::unique_ptr<Setup> setup);
    std::unique_ptr<Setup> NewSetup() const;
    void Delete();
    void ShowSetups();

    std::size_t m_current = 0; // the set-up in the grid
};

CEncroachPage::CEncroachPage(CKavo0_hdDoc* document) : CDialogPage(document, nullptr)
{
    Bindings().TellMeanings();
    Bindings().Add(m_ui.maxIter_1340, Globals().Max_no_iter);
    Bindings().EnableWhen([this] { return HasSetup(); },
                          {m_ui.setupLabel, m_ui.setup_1341, m_ui.duplicate_1345, m_ui.delete_1346});
    Bindings().EnableWhen([this] { return m_current > 0; }, {m_ui.previous_1342});
    Bindings().EnableWhen([this] { return m_current + 1 < Setups().GetCount(); }, {m_ui.next_1343});

    connect(m_ui.setup_1341, &QComboBox::activated, this, [this](int setup) { GoTo(std::size_t(setup)); });
    connect(m_ui.previous_1342, &QPushButton::clicked, this, [this] { GoTo(m_current - 1); });
    connect(m_ui.next_1343, &QPushButton::clicked, this, [this] { GoTo(m_current + 1); });
    connect(m_ui.add_1344, &QPushButton::clicked, this, [this] {
        auto setup = NewSetup();
        for (std::size_t line = 0; line < NewSetupLines; ++line)
            setup->Add();
        Insert(std::move(setup));
    });
    connect(m_ui.duplicate_1345, &QPushButton::clicked, this, [this] {
        StoreToDocument();
        auto setup = NewSetup();
        const Setup& original = Setups().GetAt(m_current);
        for (std::size_t line = 0; line < original.GetCount(); ++line)
            setup->Add(original.GetAt(line));
        Insert(std::move(setup));
    });
    connect(m_ui.delete_1346, &QPushButton::clicked, this, &CEncroachPage::Delete);
    DeclareColumns();
}

void CEncroachPage::DeclareColumns()
{
    GridColumns columns = Grid(m_ui.grid_1348);
    columns.BranchName({.width = 110}).Chainage({});
    for (const Field& field : HDEncroach::DeclaredFields()) {
        ColumnSpec options{.locked = [&field](const void* row) {
            const auto* record = static_cast<const HD_RiverPos*>(row);
            return !IsUsed(field.constAddress(row), *static_cast<const HDEncroach*>(record));
        }};
        if (field.choices) {
            options.width = 130;
            options.choices = {.whenEmptied = field.firstChoice};
        }
        columns.Value(field, std::move(options));
    }
}

CGenMetaList<HDEncroach>& CEncroachPage::Setups() const
{
    return GetDocument()->Parameters().EncroachList;
}

std::unique_ptr<CEncroachPage::Setup> CEncroachPage::NewSetup() const
{
    return std::make_unique<Setup>(Setups().InnerSectionName());
}

void CEncroachPage::LoadFromDocument(CKavo0_hdDoc* document)
{
    const std::size_t count = Setups().GetCount();
    m_current = std::min(m_current, count > 0 ? count - 1 : 0);
    CGenList* setup = HasSetup() ? &Setups().GetAt(m_current) : nullptr;
    if (setup != GetList())
        ShowList(setup);
    CLocationPage::LoadFromDocument(document);
    ShowSetups();
}

void CEncroachPage::ShowSetups()
{
    QComboBox& box = *m_ui.setup_1341;
    box.clear();
    for (std::size_t setup = 1; setup <= Setups().GetCount(); ++setup)
        box.addItem(LoadString(Str::SetupNumber).arg(setup));
    box.setCurrentIndex(HasSetup() ? int(m_current) : -1);

    QString status;
    if (!HasSetup())
        status = LoadString(Str::NoSetups);
    else if (!CGenMetaList<HDEncroach>::IsWorthKeeping(Setups().GetAt(m_current)))
        status = LoadString(Str::SetupNotSaved);
    m_ui.status_1347->setText(status);
    m_ui.status_1347->setVisible(!status.isEmpty());
}

void CEncroachPage::GoTo(std::size_t setup)
{
    if (CommitGrids()) {
        StoreToDocument();
        m_current = setup;
    }
    LoadFromDocument(GetDocument());
}

void CEncroachPage::Insert(std::unique_ptr<Setup> setup)
{
    if (!CommitGrids() || !GetDocument()->MayChange())
        return;
    StoreToDocument();
    m_current = HasSetup() ? m_current + 1 : 0;
    GetDocument()->UndoStack().push(new CSetupCommand(*GetDocument(), m_current, std::move(setup)));
    GetGrid()->setFocus();
}

void CEncroachPage::Delete()
{
    if (!CommitGrids() || !GetDocument()->MayChange())
        return;
    StoreToDocument();
    GetDocument()->UndoStack().push(new CSetupCommand(*GetDocument(), m_current, nullptr));
}

/// Number of the set-up that the list is; GetCount() for none.
std::size_t CEncroachPage::SetupOf(const void* list) const
{
    std::size_t setup = 0;
    while (setup < Setups().GetCount() && static_cast<const CGenList*>(&Setups().GetAt(setup)) != list)
        ++setup;
    return setup;
}

bool CEncroachPage::Shows(const ChangePlace& place) const
{
    return place.data == &Setups() || SetupOf(place.data) < Setups().GetCount() || CLocationPage::Shows(place);
}

void CEncroachPage::Reveal(const ChangePlace& place, bool focus)
{
    const std::size_t setup = SetupOf(place.data);
    if (setup < Setups().GetCount() && setup != m_current) {
        m_current = setup;
        LoadFromDocument(GetDocument());
    }
    CLocationPage::Reveal(place, focus);
}

} // namespace

const PageMaker MakeEncroachPage = &MakePage<CEncroachPage>;
