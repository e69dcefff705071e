// Undo of adding and deleting encroachment set-ups.
#pragma once

#include "data/hd_parameters.h"
#include "ks/fc/doc_command.h"

class CKavo0_hdDoc;

class CSetupCommand : public CDocumentCommand
{
public:
    /// Puts `setup` in at `index`; null takes the set-up out that stands there.
    CSetupCommand(CKavo0_hdDoc& document, std::size_t index, std::unique_ptr<CGenParamList<HDEncroach>> setup);

protected:
    ChangePlace Apply() override { return Exchange(); }
    ChangePlace Revert() override { return Exchange(); }

private:
    ChangePlace Exchange();

    CGenMetaList<HDEncroach>& m_setups;
    std::size_t m_index;
    std::unique_ptr<CGenParamList<HDEncroach>> m_setup; // while it is out of the document
};
