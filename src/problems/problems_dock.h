// The window beside the document windows that lists the problems of all open documents.
#pragma once

#include "ks/fc/dock.h"

class CProblemsPanel;

class CProblemsDock : public CKsDock
{
    Q_OBJECT
public:
    inline static const QString Name = QStringLiteral("problemsDock");

    explicit CProblemsDock(CKsMDIFrameWnd& frame);
    CProblemsPanel& Panel() const { return *m_panel; }

protected:
    void Retranslate() override;

private:
    CProblemsPanel* m_panel;
};
