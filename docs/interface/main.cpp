#include "InterfacePage.h"

#include <fstream>
#include <iostream>

// Writes the reference page of the public interface to the file named.
int main(int argc, char** argv) {
    if (argc != 2) {
        std::cerr << "usage: interface-page FILE\n";
        return 2;
    }
    std::ofstream out(argv[1], std::ios::binary);
    out << docs::interfacePage();
    out.close();
    if (!out) {
        std::cerr << "interface-page: cannot write " << argv[1] << "\n";
        return 1;
    }
    return 0;
}
