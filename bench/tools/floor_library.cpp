// The one function the floor program loads and calls.
#include <iostream>

extern "C" void Run() { std::cout << "floor\n"; }
