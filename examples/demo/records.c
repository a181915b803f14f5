// SPDX-License-Identifier: Apache-2.0
// The act about problem determination: three layouts of one event, and a filter that goes by
// message identifiers. Its objects are described in demo.properties.
#include "acts.h"
#include "zelvo.h"

/// The directory of compiled messages; see tree.c.
static const char BUNDLE[] = DEMO_BUNDLE;

/// What a till reports: two messages for information, and one error again and again.
static void sell(ZlvObject *log)
{
    ZlvLogInfo(log, BUNDLE, "till_opened", u"Anna");
    for (int tries = 1; tries <= 3; ++tries)
        ZlvLogError(log, BUNDLE, "till_jammed", u"drawer", tries);
    ZlvLogError(log, BUNDLE, "till_offline", u"db.example.org");
    ZlvLogInfo(log, BUNDLE, "till_closed", u"Anna");
}

void showRecords(void)
{
    ZlvObject *log = ZlvGetObject("desk.log", NULL);
    scene("One event, three layouts",
          "The logger stamps product, component and server on the event. A line for people, an\n"
          "XML record with everything, a trace line with fixed fields.");
    ZlvLogError(log, BUNDLE, "till_jammed", u"drawer", 1);

    scene("Identifiers decide",
          "The filter blocks the identifiers TIL...I, and passes each of the others at most once\n"
          "in a minute: six calls, two records.");
    ZlvSetObjProp(log, "listenerNames", "filter.ids");
    sell(log);
    ZlvReleaseObject(log);
}
