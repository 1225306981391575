// Times whole processes against a floor, run by run in pairs, so that both
// sides of a ratio see the same machine at the same moment.
//
//   paired_runs ROUNDS FLOOR_COMMAND < command-lines
//
// FLOOR_COMMAND is one command line; each line of standard input is another
// (words split at blanks; a word in double quotes may hold blanks). In each
// round every line runs once, right after a run of the floor; standard output
// and error go to /dev/null. For each line it prints, tab-separated: the
// median wall time of the floor and of the line in microseconds, the median
// of the per-pair ratios of wall time and of CPU time (user + system), and
// the line itself.
#include <fcntl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <time.h>
#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <iostream>
#include <string>
#include <vector>

namespace {

struct Sample {
    double wallMicros = 0;
    double cpuMicros = 0;
};

std::vector<std::string> SplitWords(std::string const& line) {
    std::vector<std::string> words;
    std::string word;
    bool quoted = false, inWord = false;
    for (char c : line) {
        if (c == '"') {
            quoted = !quoted;
            inWord = true;
        } else if ((c == ' ' || c == '\t') && !quoted) {
            if (inWord) words.push_back(word);
            word.clear();
            inWord = false;
        } else {
            word += c;
            inWord = true;
        }
    }
    if (inWord) words.push_back(word);
    return words;
}

double Micros(timeval const& t) { return t.tv_sec * 1e6 + t.tv_usec; }

Sample Run(std::vector<std::string> const& words) {
    std::vector<char*> argv;
    for (std::string const& word : words) argv.push_back(const_cast<char*>(word.c_str()));
    argv.push_back(nullptr);
    timespec start{}, end{};
    clock_gettime(CLOCK_MONOTONIC, &start);
    pid_t child = fork();
    if (child == 0) {
        int null = open("/dev/null", O_WRONLY);
        dup2(null, 1);
        dup2(null, 2);
        execvp(argv[0], argv.data());
        _exit(127);
    }
    int status = 0;
    rusage usage{};
    wait4(child, &status, 0, &usage);
    clock_gettime(CLOCK_MONOTONIC, &end);
    if (!WIFEXITED(status) || WEXITSTATUS(status) == 127) {
        std::cerr << "paired_runs: cannot run " << words[0] << "\n";
        std::exit(2);
    }
    Sample sample;
    sample.wallMicros = (end.tv_sec - start.tv_sec) * 1e6 + (end.tv_nsec - start.tv_nsec) / 1e3;
    sample.cpuMicros = Micros(usage.ru_utime) + Micros(usage.ru_stime);
    return sample;
}

double Median(std::vector<double> values) {
    std::sort(values.begin(), values.end());
    size_t const middle = values.size() / 2;
    return values.size() % 2 ? values[middle] : (values[middle - 1] + values[middle]) / 2;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 3) {
        std::cerr << "usage: paired_runs ROUNDS FLOOR_COMMAND < command-lines\n";
        return 2;
    }
    int const rounds = std::atoi(argv[1]);
    std::vector<std::string> const floor = SplitWords(argv[2]);
    std::vector<std::string> lines;
    for (std::string line; std::getline(std::cin, line);) {
        if (!line.empty() && line[0] != '#') lines.push_back(line);
    }
    size_t const count = lines.size();
    std::vector<std::vector<double>> floorWall(count), wall(count), wallRatio(count), cpuRatio(count);
    for (int round = 0; round < rounds; ++round) {
        for (size_t i = 0; i < count; ++i) {
            Sample const base = Run(floor);
            Sample const sample = Run(SplitWords(lines[i]));
            floorWall[i].push_back(base.wallMicros);
            wall[i].push_back(sample.wallMicros);
            wallRatio[i].push_back(sample.wallMicros / base.wallMicros);
            cpuRatio[i].push_back(sample.cpuMicros / std::max(base.cpuMicros, 1.0));
        }
    }
    for (size_t i = 0; i < count; ++i) {
        std::printf("%.0f\t%.0f\t%.2f\t%.2f\t%s\n", Median(floorWall[i]), Median(wall[i]), Median(wallRatio[i]),
                    Median(cpuRatio[i]), lines[i].c_str());
    }
    return 0;
}
