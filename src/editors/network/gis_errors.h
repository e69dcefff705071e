// What the GIS library says while it works, kept from the terminal and at hand.
#pragma once

#include <QStringList>
#include <cpl_error.h>
#include <utility>

class CGisErrors
{
public:
    CGisErrors() { CPLPushErrorHandlerEx(&CGisErrors::Hear, this); }
    ~CGisErrors() { CPLPopErrorHandler(); }
    CGisErrors(const CGisErrors&) = delete;
    CGisErrors& operator=(const CGisErrors&) = delete;

    /// The errors since the last call, none of them twice. Warnings are about what was read all the same.
    QStringList Take() { return std::exchange(m_said, {}); }

private:
    static void CPL_STDCALL Hear(CPLErr kind, CPLErrorNum, const char* text)
    {
        auto* errors = static_cast<CGisErrors*>(CPLGetErrorHandlerUserData());
        const QString said = QString::fromUtf8(text).simplified();
        if (kind >= CE_Failure && !said.isEmpty() && !errors->m_said.contains(said))
            errors->m_said << said;
    }
    QStringList m_said;
};
