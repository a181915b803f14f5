/* SPDX-License-Identifier: Apache-2.0 */
/* Stands in for syslog(3) and prints what it is told: "ident facility.priority: text". */
#define _DEFAULT_SOURCE
#define SYSLOG_NAMES
#include <stdarg.h>
#include <stdio.h>
#include <syslog.h>

static const char *ident = "(none)";
static int facility = LOG_USER;

static const char *name_of(const CODE *names, int value)
{
    while (names->c_name != NULL && names->c_val != value)
        ++names;
    return names->c_name != NULL ? names->c_name : "(unknown)";
}

void openlog(const char *new_ident, int options, int new_facility)
{
    (void)options;
    ident = new_ident;
    facility = new_facility;
}

void closelog(void)
{
    ident = "(closed)";
}

void syslog(int priority, const char *format, ...)
{
    va_list args;
    va_start(args, format);
    printf("%s %s.%s: ", ident, name_of(facilitynames, facility), name_of(prioritynames, priority));
    vprintf(format, args);
    printf("\n");
    va_end(args);
}
