// The window of an HD parameter document.
#pragma once

#include "ks/fc/frames.h"

class CDlgFrame : public CKsMDIChildWnd
{
    Q_OBJECT
public:
    using CKsMDIChildWnd::CKsMDIChildWnd;
};
