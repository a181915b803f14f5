/* SPDX-License-Identifier: Apache-2.0 */
/*
 * Stands for the C library's function in programs that open the toolkit thousands of times: where a
 * machine does not know its own name, each of them would wait for name servers.
 */
#define _DEFAULT_SOURCE
#include <netdb.h>
#include <stddef.h>
#include <sys/socket.h>

static char hostName[] = "host.example.org";
static char *noNames[] = {NULL};

struct hostent *gethostbyname(const char *name)
{
    static struct hostent host = {
        .h_name = hostName, .h_aliases = noNames, .h_addrtype = AF_INET, .h_addr_list = noNames};
    return name != NULL ? &host : NULL;
}
