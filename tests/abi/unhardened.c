/* SPDX-License-Identifier: Apache-2.0 */
/* A library without any of the protection that tests/abi/check_hardening looks for. */
#include <string.h>

static int counter;

/* Its code holds the address of its data: built without -fPIC, that is a relocation of code. */
int *zelvo_unhardened_counter(void)
{
    return &counter;
}

/* A buffer that other builds would guard, in a frame that they would probe. */
size_t zelvo_unhardened_copy(char *target, const char *text, size_t length)
{
    char buffer[3 * 4096];
    memcpy(buffer, text, length);
    memcpy(target, buffer, length);
    return strlen(target);
}
