// SPDX-License-Identifier: Apache-2.0
// Act two: four processes share one log file, which rolls over while they write.
#define _XOPEN_SOURCE 700
#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <sys/sem.h>
#include <sys/wait.h>
#include <unistd.h>

#include "acts.h"
#include "zelvo.h"

enum { TILLS = 4, SALES = 500, MOST_FILES = 100 };

/// The file number NUMBER of the log; the live one is number 0.
static const char *fileName(int number)
{
    static char name[32];
    char digits[12] = "";
    if (number > 0)
        snprintf(digits, sizeof digits, "%d", number);
    snprintf(name, sizeof name, "sales%s.log", digits);
    return name;
}

void runTill(int32_t till, const char *semaphoreKey)
{
    ZlvObject *log = ZlvGetObject("till.log", NULL);
    ZlvObject *file = ZlvGetObject("file.shared", NULL);
    ZlvSetObjProp(file, "MPFileSemKey", semaphoreKey);
    for (int32_t sale = 1; sale <= SALES; ++sale)
        ZlvLogUText(log, u"till {0,number,integer} sale {1,number,integer}", till, sale);
    ZlvReleaseObject(file);
    ZlvReleaseObject(log);
}

/// Starts this program once more, as a till.
static int64_t startTill(int till, char *semaphoreKey)
{
    char number[12];
    snprintf(number, sizeof number, "%d", till);
    char *const arguments[] = {"zelvo_demo", number, semaphoreKey, NULL};
    int64_t process = -1;
    CxProcessCreate(&process, "/proc/self/exe", arguments);
    return process;
}

/// Counts the records of each till in one file, which it removes; 0 when there is no such file.
static int countFile(const char *name, int records[TILLS + 1])
{
    FILE *file = fopen(name, "r");
    if (file == NULL)
        return 0;
    char line[128];
    while (fgets(line, sizeof line, file) != NULL) {
        const char *mark = strstr(line, " | till ");
        const long till = mark != NULL ? strtol(mark + strlen(" | till "), NULL, 10) : 0;
        if (till >= 1 && till <= TILLS && strchr(line, '\n') != NULL)
            ++records[till];
    }
    fclose(file);
    remove(name);
    return 1;
}

static void countRecords(void)
{
    int records[TILLS + 1] = {0};
    int files = 0;
    for (int number = 0; number < MOST_FILES; ++number)
        files += countFile(fileName(number), records);
    for (int till = 1; till <= TILLS; ++till)
        printf("process %d: %d of %d records came through\n", till, records[till], SALES);
    printf("in %d files\n\n", files);
}

void shareFile(void)
{
    char directory[] = "/tmp/zelvo_demo_XXXXXX";
    if (mkdtemp(directory) == NULL || chdir(directory) != 0)
        return;
    // Everybody who shares a file uses the same key, and nobody else on the machine should.
    char semaphoreKey[12];
    snprintf(semaphoreKey, sizeof semaphoreKey, "%d", (int)getpid());

    scene("Four processes, one file that rolls over",
          "Each process logs to sales.log, which becomes sales1.log, sales2.log and so on. One\n"
          "semaphore among them all keeps records whole.");
    int64_t tills[TILLS];
    for (int till = 0; till < TILLS; ++till)
        tills[till] = startTill(till + 1, semaphoreKey);
    for (int till = 0; till < TILLS; ++till)
        waitpid((pid_t)tills[till], NULL, 0);
    countRecords();

    // The semaphore outlives the processes that use it, until somebody removes it.
    semctl(semget((key_t)getpid(), 1, 0), 0, IPC_RMID);
    rmdir(directory);
}
