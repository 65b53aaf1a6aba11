// Writes the colour library's generated sources: the tristimulus weight
// tables and the display curve.
//   weighttables <data dir> <WeightTables.inc> <ColorMathGamma.cpp> <ColorMathDensityWeights.cpp>
// A file is rewritten only when its contents change.
#include "weightgen.h"

#include <fstream>
#include <iostream>
#include <sstream>

namespace {

bool writeIfChanged(const std::string& path, const std::string& text)
{
    std::ifstream in(path, std::ios::binary);
    if (in) {
        std::ostringstream old;
        old << in.rdbuf();
        if (old.str() == text)
            return true;
    }
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    out << text;
    out.close();
    if (!out) {
        std::cerr << "weighttables: cannot write " << path << "\n";
        return false;
    }
    std::cout << "weighttables: wrote " << path << "\n";
    return true;
}

} // namespace

int main(int argc, char** argv)
{
    if (argc != 5) {
        std::cerr << "usage: weighttables <data dir> <WeightTables.inc> <ColorMathGamma.cpp> <ColorMathDensityWeights.cpp>\n";
        return 2;
    }
    try {
        const std::string tables = WeightGen::weightTablesSource(argv[1]);
        const std::string gamma = WeightGen::gammaSource();
        const std::string density = WeightGen::densitySource(argv[1]);
        return writeIfChanged(argv[2], tables) && writeIfChanged(argv[3], gamma) && writeIfChanged(argv[4], density)
                   ? 0
                   : 1;
    } catch (const std::exception& e) {
        std::cerr << "weighttables: " << e.what() << "\n";
        return 1;
    }
}
