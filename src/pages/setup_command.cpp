#include "pages/setup_command.h"

#include "document/document.h"
#include "res/strings.h"

CSetupCommand::CSetupCommand(CKavo0_hdDoc& document, std::size_t index,
                             std::unique_ptr<CGenParamList<HDEncroach>> setup)
    : CDocumentCommand(document, LoadString(setup ? Str::UndoAddSetup : Str::UndoDeleteSetup)),
      m_setups(document.Parameters().EncroachList),
      m_index(index),
      m_setup(std::move(setup))
{
}

ChangePlace CSetupCommand::Exchange()
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
