// SPDX-License-Identifier: Apache-2.0
// A daemon with two workers, all of which log to one file.
//
// `daemon DIRECTORY` works in a directory with a daemon.properties such as the one in
// examples/daemon. It prints its process number when it is ready and goes on in the background;
// `daemon -f DIRECTORY` stays in the foreground, as service managers like it. SIGHUP makes it read
// its properties and open its log anew, SIGTERM ends it.
//
// It goes to the background first and opens the toolkit then, so that nobody closes descriptors or
// ends a process any more once a log is open. A failure still shows in the status of the starter.
#define _DEFAULT_SOURCE
#include <signal.h>
#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <sys/signalfd.h>
#include <sys/wait.h>
#include <unistd.h>

#include "zelvo.h"

static const char PROPERTIES[] = "daemon.properties";

enum { WORKERS = 2 };

/// What a process knows of itself: the daemon is number 0, its workers are 1 and 2.
typedef struct Process {
    int32_t number;
    int signals;
    ZlvObject *logger;
    pid_t workers[WORKERS];
} Process;

static int openLog(Process *self)
{
    self->logger = ZlvOpenToolkit(PROPERTIES, NULL) ? ZlvGetObject("daemon.log", NULL) : NULL;
    return self->logger != NULL;
}

static void closeLog(Process *self)
{
    ZlvReleaseObject(self->logger); // lets go of the file too
    ZlvCloseToolkit();
}

/// Tries in a process of its own whether the log would open with the properties of today.
static int wouldOpen(Process *self)
{
    const pid_t trial = fork();
    if (trial == 0) {
        closeLog(self);
        _exit(openLog(self) ? 0 : 1);
    }
    int result = 1;
    return trial > 0 && waitpid(trial, &result, 0) == trial && result == 0;
}

/// An open toolkit reads no file, so it is closed first. A mistake must not cost the daemon its
/// log.
static void reconfigure(Process *self)
{
    if (!wouldOpen(self)) {
        ZlvLogUText(self->logger, u"{0,number,integer}: refused, nothing has changed",
                    self->number);
        return;
    }
    closeLog(self);
    openLog(self);
    ZlvLogUText(self->logger, u"{0,number,integer}: reconfigured", self->number);
    ZLV_DEBUG_MIN(self->logger, u"{0,number,integer}: in detail", self->number);
}

/// Signals are never handled, which would be in the middle of a call that logs perhaps: they are
/// blocked, and wait in a descriptor until somebody reads it.
static int takeSignals(void)
{
    sigset_t taken;
    sigemptyset(&taken);
    sigaddset(&taken, SIGHUP);
    sigaddset(&taken, SIGTERM);
    sigprocmask(SIG_BLOCK, &taken, NULL);
    return signalfd(-1, &taken, SFD_CLOEXEC);
}

/// The next signal of the process that asks; with other work to do it would poll() the descriptor.
static int nextSignal(const Process *self)
{
    struct signalfd_siginfo info;
    return read(self->signals, &info, sizeof info) == sizeof info ? (int)info.ssi_signo : 0;
}

static void serveAsWorker(Process *self)
{
    ZlvLogUText(self->logger, u"{0,number,integer}: works", self->number);
    for (int got = 0; got != SIGTERM; got = nextSignal(self))
        if (got == SIGHUP)
            reconfigure(self);
    ZlvLogUText(self->logger, u"{0,number,integer}: ends", self->number);
}

/// A worker has the open toolkit of the daemon and logs at once; both may, as the file is shared.
static void startWorker(Process *self, int place)
{
    self->workers[place] = fork();
    if (self->workers[place] != 0)
        return;
    self->number = place + 1;
    serveAsWorker(self);
    closeLog(self);
    exit(0);
}

static void tellWorkers(const Process *self, int signal)
{
    for (int place = 0; place < WORKERS; ++place)
        if (self->workers[place] > 0) // where fork() has failed there is none
            kill(self->workers[place], signal);
}

static void serve(Process *self)
{
    int got = 0;
    while (got != SIGTERM) {
        got = nextSignal(self);
        if (got == SIGHUP)
            reconfigure(self);
        tellWorkers(self, got);
    }
    while (wait(NULL) != -1)
        continue;
}

/// Returns in the background only. The starter waits until it is told by the descriptor returned.
static int goToBackground(void)
{
    int ready[2];
    if (pipe(ready) != 0)
        exit(1);
    const pid_t child = fork();
    if (child != 0) {
        close(ready[1]);
        char line[32];
        const ssize_t length = child > 0 ? read(ready[0], line, sizeof line) : 0;
        exit(length > 0 && write(STDOUT_FILENO, line, (size_t)length) == length ? 0 : 1);
    }
    close(ready[0]);
    if (daemon(1, 0) != 0) // 1: in the same directory
        _exit(1);
    return ready[1];
}

int main(int argc, char **argv)
{
    const int inForeground = argc > 1 && strcmp(argv[1], "-f") == 0;
    if (argc != 2 + inForeground || chdir(argv[argc - 1]) != 0)
        return 2;

    const int ready = inForeground ? STDOUT_FILENO : goToBackground();
    Process self = {.number = 0, .signals = takeSignals()};
    if (!openLog(&self))
        return 1;
    ZlvLogUText(self.logger, u"0: starts");
    for (int place = 0; place < WORKERS; ++place)
        startWorker(&self, place);
    dprintf(ready, "%d\n", (int)getpid());
    close(ready);

    serve(&self);
    ZlvLogUText(self.logger, u"0: stops");
    closeLog(&self);
    return 0;
}
