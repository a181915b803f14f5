// SPDX-License-Identifier: Apache-2.0
// The dates of records.
#pragma once

#include <unicode/ucal.h>
#include <unicode/udat.h>

#include "CxUStringBuff.h"

namespace zelvo {

/// A form of dates in the default locale and zone, as long as it is open.
class DateFormat {
public:
    /// Opens a form: that of an ICU date pattern or, without one, the default form, which ends with
    /// the zone. False when ICU refuses or memory ran out.
    bool open(const char *pattern);
    void close();

    /// Tells whether it is open in all its parts: without the calendar it shows UTC.
    bool isWhole() const;

    /// Appends a time; nothing when ICU writes nothing or memory ran out.
    void append(CxUStringBuff *out, UDate time) const;

private:
    bool openDefaultForm();

    UDateFormat *format_ = nullptr;
    UCalendar *calendar_ = nullptr; ///< knows the zone's distance from UTC
    bool showsZone_ = false;
};

} // namespace zelvo
