// haldensim: controls the simulated host (create, import, export, faults).
#include <iostream>
#include <string>
#include <vector>

#include "trellis/sim/Haldensim.h"

int main(int argc, char** argv) {
    std::vector<std::string> args(argv + 1, argv + argc);
    return Trellis::Sim::RunHaldensim(args, std::cin, std::cout, std::cerr);
}
