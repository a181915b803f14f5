// SPDX-License-Identifier: Apache-2.0
// Four processes log to one file, which rolls over while they write. At the end each record stands
// whole in exactly one of the files.
//
// Start it as `processes`. Its files are in a temporary directory, which it removes, as it does the
// semaphore that the processes share.
#define _XOPEN_SOURCE 700
#include <errno.h>
#include <stdio.h>
#include <stdlib.h>
#include <sys/sem.h>
#include <sys/wait.h>
#include <unistd.h>

#include "zelvo.h"

enum { PROCESSES = 4, FIRST = 100, RECORDS = 500, MOST_FILES = 100 };

/// Makes the file and a logger for it. Everybody who shares a file names the same key.
static ZlvObject *openLog(key_t key)
{
    ZlvObject *logger = ZlvGetObject("app.log", "zlv_basiclogger");
    ZlvObject *file = ZlvGetObject("shared.file", "zlv_multiproc_filehandler");
    ZlvSetObjProp(file, "fileName", "shared.log");
    ZlvSetObjPropInt(file, "maxFileBytes", 8192);
    ZlvSetObjPropInt(file, "maxFiles", MOST_FILES);
    ZlvSetObjPropInt(file, "MPFileSemKey", key);
    ZlvObject *format = ZlvHandlerGetFormatter(file);
    ZlvSetObjProp(format, "locale", "en"); // numbers for a program to read, whoever starts this one
    ZlvReleaseObject(format);
    ZlvAddListener(logger, file);
    ZlvReleaseObject(file); // the logger holds it now
    return logger;
}

/// What each process does: it opens the toolkit for itself, logs and closes it.
static int work(int32_t process, key_t key)
{
    if (!ZlvOpenToolkit(NULL, NULL))
        return 1;
    ZlvObject *logger = openLog(key);
    int failures = 0;
    // Numbers of three digits make records of one length, and so files of one length.
    for (int32_t record = 0; record < RECORDS; ++record) {
        const ZlvStatus status =
            ZlvLogUText(logger, u"process {0,number,integer} record {1,number,integer}", process,
                        FIRST + record);
        failures += status.type != CX_STATUS_OK;
    }
    ZlvReleaseObject(logger);
    ZlvCloseToolkit();
    return failures != 0;
}

/// Starts all processes and waits for them; gives the number of those that failed.
static int runProcesses(key_t key)
{
    for (int32_t process = 0; process < PROCESSES; ++process)
        if (fork() == 0)
            _exit(work(process, key));
    int failed = 0;
    int result = 0;
    while (wait(&result) != -1)
        failed += result != 0;
    return failed;
}

typedef struct Tally {
    int files;
    int torn; ///< lines that are no record
    int times[PROCESSES][RECORDS];
} Tally;

static void countLine(const char *line, Tally *tally)
{
    int process = 0;
    int number = 0;
    int end = 0;
    // NOLINTNEXTLINE(cert-err34-c): what does not fit its place in the tally is torn.
    const int found = sscanf(line, "%*s %*s process %1d record %3d%n", &process, &number, &end);
    const int record = number - FIRST;
    if (found == 2 && line[end] == '\n' && process < PROCESSES && record >= 0 && record < RECORDS)
        ++tally->times[process][record];
    else
        ++tally->torn;
}

/// Counts the records of one file and removes it; number 0 is the live one.
static void countFile(int number, Tally *tally)
{
    char name[32] = "shared.log";
    if (number > 0)
        snprintf(name, sizeof name, "shared%d.log", number);
    FILE *file = fopen(name, "r");
    if (file == NULL)
        return;
    ++tally->files;
    char line[128];
    while (fgets(line, sizeof line, file) != NULL)
        countLine(line, tally);
    fclose(file);
    remove(name);
}

/// Prints what became of the records; gives 1 unless each stands there once.
static int report(const Tally *tally)
{
    int lost = 0;
    int doubled = 0;
    for (int process = 0; process < PROCESSES; ++process)
        for (int record = 0; record < RECORDS; ++record) {
            lost += tally->times[process][record] == 0;
            doubled += tally->times[process][record] > 1;
        }
    printf("%d records in %d files: %d lost, %d doubled, %d torn\n", PROCESSES * RECORDS,
           tally->files, lost, doubled, tally->torn);
    return lost + doubled + tally->torn != 0;
}

/// The semaphore outlives the processes that use it, until somebody removes it.
static void removeSemaphore(key_t key)
{
    semctl(semget(key, 1, 0), 0, IPC_RMID);
    if (semget(key, 1, 0) == -1 && errno == ENOENT)
        printf("no semaphore is left\n");
}

int main(void)
{
    char directory[] = "/tmp/zelvo_processes_XXXXXX";
    if (mkdtemp(directory) == NULL || chdir(directory) != 0)
        return 1;
    const key_t key = ftok(directory, 'z'); // from the place of the file: others have other keys

    const int failed = runProcesses(key);
    Tally tally = {0};
    for (int number = 0; number < MOST_FILES; ++number)
        countFile(number, &tally);
    const int wrong = report(&tally);
    removeSemaphore(key);
    rmdir(directory);
    return failed + wrong != 0;
}
