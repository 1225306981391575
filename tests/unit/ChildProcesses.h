#pragma once

// Runs a function in several forked processes at once, for tests of what
// concurrent processes do to one host. Each child waits until all are
// forked, runs body(index), and exits with its result (0..255) without
// running the parent's destructors. A child that throws exits with 255.

#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include <functional>
#include <stdexcept>
#include <vector>

inline std::vector<int> RunInChildren(int count, const std::function<int(int)>& body) {
    int gate[2];
    if (::pipe(gate) != 0) throw std::runtime_error("pipe failed");
    std::vector<pid_t> children;
    for (int i = 0; i < count; ++i) {
        pid_t pid = ::fork();
        if (pid < 0) throw std::runtime_error("fork failed");
        if (pid == 0) {
            ::close(gate[1]);
            char byte;
            while (::read(gate[0], &byte, 1) > 0) {
            }
            int status = 255;
            try {
                status = body(i);
            } catch (...) {
            }
            ::_exit(status);
        }
        children.push_back(pid);
    }
    ::close(gate[0]);
    ::close(gate[1]);  // end of file: every child starts now
    std::vector<int> statuses;
    for (pid_t pid : children) {
        int status = 0;
        ::waitpid(pid, &status, 0);
        statuses.push_back(WIFEXITED(status) ? WEXITSTATUS(status) : -1);
    }
    return statuses;
}
