// SPDX-License-Identifier: Apache-2.0
// The acts of the demo, one file each, and the headings that tell their story.
#ifndef DEMO_ACTS_H
#define DEMO_ACTS_H

#include <stdint.h>

/// Prints the heading of the next act.
void act(const char *title);

/// Prints the heading of a scene and what to look for in it.
void scene(const char *title, const char *explanation);

/// One tree of objects that logs in several languages and changes while it runs (tree.c).
void showTree(void);

/// Several processes that write to one log file (tills.c).
void shareFile(void);

/// What one of those processes does; each is this program, started with these two arguments.
void runTill(int32_t till, const char *semaphoreKey);

/// One event in all layouts, and a filter that knows message identifiers (records.c).
void showRecords(void);

#endif
