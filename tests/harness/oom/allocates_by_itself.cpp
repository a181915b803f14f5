// SPDX-License-Identifier: Apache-2.0
// What check_allocators has to find.
#include <cstdlib>
#include <cstring>

void *allocated(size_t size);
char *created(char c);
char *duplicated(const char *text);

void *allocated(size_t size)
{
    return std::malloc(size);
}

char *created(char c)
{
    return new char(c);
}

char *duplicated(const char *text)
{
    return strdup(text);
}
