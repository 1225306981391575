// The floor of a command's cost: a C++ program that loads one shared library
// with dlopen and calls its one function, which prints a line.
#include <dlfcn.h>

#include <iostream>

int main(int argc, char** argv) {
    if (argc != 2) return 2;
    void* library = dlopen(argv[1], RTLD_NOW | RTLD_LOCAL);
    if (!library) {
        std::cerr << dlerror() << "\n";
        return 2;
    }
    reinterpret_cast<void (*)()>(dlsym(library, "Run"))();
    return 0;
}
