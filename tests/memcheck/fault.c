/* SPDX-License-Identifier: Apache-2.0 */
/* A program with one fault of memory, which its argument names; without one it has none. */
#include <stdio.h>
#include <stdlib.h>
#include <string.h>

enum { LENGTH = 8 };

/* Which byte is read, and whether it was written, only shows when the program runs. */
static void readByte(const char *bytes, int index)
{
    if (bytes[index] == 'x')
        puts("found an x");
}

int main(int argc, char **argv)
{
    const char *fault = argc > 1 ? argv[1] : "";
    char *bytes = malloc(LENGTH);
    if (bytes == NULL)
        return 1;
    if (strcmp(fault, "uninitialised") != 0)
        memset(bytes, 'a', LENGTH);
    readByte(bytes, strcmp(fault, "beyond") == 0 ? LENGTH : 0);
    if (strcmp(fault, "leak") != 0)
        free(bytes);
    return 0;
}
