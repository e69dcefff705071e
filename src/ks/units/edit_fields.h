// Single-value fields of the shell: an integer field with its range, and the exchange of a number with a plain field.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"
#include "ks/units/edit_style.h"

#include <QLineEdit>
#include <cstdint>
#include <limits>
#include <optional>

/// The values from `low` to `high`, both included.
template <typename T>
struct CKSinterval
{
    T low = std::numeric_limits<T>::lowest(), high = std::numeric_limits<T>::max();
    bool Contains(T value) const { return value >= low && value <= high; }
};

/// The size of a field for a number, which is the same all over a page: as many digits as are usual fit, and no wide
/// window makes it longer.
KS_API QSize KsNumberFieldSize(const QLineEdit& field);

/// Says in the empty field what it is for. A theme may have a color for such hints that nobody sees; this one is seen.
KS_API void KsShowHint(QLineEdit& field, const QString& hint);

/// A field for a 32-bit integer.
class KS_API CKsEditLong : public QLineEdit
{
    Q_OBJECT
public:
    explicit CKsEditLong(QWidget* parent = nullptr);
    void SetRange(const CKSinterval<std::int32_t>& range) { m_range = range; }
    void SetValue(std::int32_t value);
    /// What the field holds; nothing when that is no integer of the range.
    std::optional<std::int32_t> Value() const;
    /// As Value, but first tells the user what is wrong and puts the focus back into the field.
    std::optional<std::int32_t> CheckedValue();
    /// Why the text is no integer of the range; empty when it is one.
    CString Complaint() const;
    QSize sizeHint() const override { return KsNumberFieldSize(*this); }

private:
    CKSinterval<std::int32_t> m_range;
};

/// Exchanges a number with a field: `save` false shows it in the style's format, with the style's unit as tool tip;
/// `save` true takes it. `value` is in the style's display unit, nothing is converted. An empty field leaves the value
/// as it is; text that is no number is reported to the user, leaves the value as it is and answers false.
KS_API bool DDX_KSedit(bool save, QLineEdit& edit, double& value, const CKsEditStyle& style);
