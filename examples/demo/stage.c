// SPDX-License-Identifier: Apache-2.0
// The headings of the demo.
#include <stdio.h>

#include "acts.h"

void act(const char *title)
{
    static int number;
    printf("======== Act %d: %s\n\n", ++number, title);
}

void scene(const char *title, const char *explanation)
{
    printf("-------- %s\n%s\n\n", title, explanation);
}
