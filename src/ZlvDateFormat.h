// SPDX-License-Identifier: Apache-2.0
// The dates of records.
#pragma once

#include <unicode/ucal.h>
#include <unicode/udat.h>

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

    /// The text of a time, freed by the caller; null when ICU writes none or memory ran out.
    UChar *text(UDate time) const;

private:
    bool openDefaultForm();

    UDateFormat *format_ = nullptr;
    UCalendar *calendar_ = nullptr; ///< knows the zone's distance from UTC
    bool showsZone_ = false;
};

} // namespace zelvo
