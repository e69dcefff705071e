#include "shell/handover.h"

#include <QSocketNotifier>

bool CHandover::Give(const QStringList&)
{
    return false;
}

CHandover::CHandover(Taker take) : m_take(std::move(take)) {}

CHandover::~CHandover() = default;

void CHandover::Accept() {}

void CHandover::Read(int) {}
