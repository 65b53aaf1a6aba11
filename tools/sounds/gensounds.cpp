// Writes the instrument's sounds as small WAV files from a plain text list of
// notes, so the repository holds no binary audio. Usage:
//   gensounds <sounds.txt> <output directory>
// Deterministic: the same list always gives the same bytes.

#include <cmath>
#include <cstdint>
#include <cstdio>
#include <fstream>
#include <iostream>
#include <sstream>
#include <string>
#include <vector>

namespace {

const int kRate = 22050;
const double kPi = 3.14159265358979323846;

struct Note
{
    double frequency;
    int milliseconds;
};

void put16(std::ofstream& out, std::uint16_t v)
{
    const char b[2] = {char(v & 0xff), char(v >> 8)};
    out.write(b, 2);
}

void put32(std::ofstream& out, std::uint32_t v)
{
    const char b[4] = {char(v & 0xff), char((v >> 8) & 0xff), char((v >> 16) & 0xff), char(v >> 24)};
    out.write(b, 4);
}

// A tone with two soft overtones, so it carries on a small speaker without
// sounding harsh.
void render(const Note& note, std::vector<double>& samples)
{
    const int count = note.milliseconds * kRate / 1000;
    const bool struck = note.milliseconds <= 25;
    const int attack = kRate * 2 / 1000;
    const int release = std::min(count / 3, kRate * 30 / 1000);
    for (int i = 0; i < count; ++i) {
        double value = 0.0;
        if (note.frequency > 0.0) {
            const double t = double(i) / kRate;
            const double w = 2.0 * kPi * note.frequency * t;
            value = std::sin(w) + 0.25 * std::sin(2.0 * w) + 0.08 * std::sin(3.0 * w);
            double envelope = 1.0;
            if (i < attack)
                envelope = double(i) / attack;
            if (struck)
                envelope *= std::exp(-6.0 * double(i) / count);
            else if (i > count - release && release > 0)
                envelope *= double(count - i) / release;
            value *= envelope;
        }
        samples.push_back(value);
    }
}

bool writeWav(const std::string& path, const std::vector<double>& samples)
{
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    if (!out)
        return false;
    const std::uint32_t dataBytes = std::uint32_t(samples.size() * 2);
    out.write("RIFF", 4);
    put32(out, 36 + dataBytes);
    out.write("WAVE", 4);
    out.write("fmt ", 4);
    put32(out, 16);
    put16(out, 1); // PCM
    put16(out, 1); // mono
    put32(out, kRate);
    put32(out, kRate * 2);
    put16(out, 2);
    put16(out, 16);
    out.write("data", 4);
    put32(out, dataBytes);
    const double gain = 0.55 * 32767.0 / 1.33; // headroom for the overtones
    for (double s : samples) {
        long v = std::lround(s * gain);
        v = std::max(-32768L, std::min(32767L, v));
        put16(out, std::uint16_t(std::int16_t(v)));
    }
    return bool(out);
}

} // namespace

int main(int argc, char** argv)
{
    if (argc != 3) {
        std::cerr << "usage: gensounds <sounds.txt> <output directory>\n";
        return 2;
    }
    std::ifstream list(argv[1]);
    if (!list) {
        std::cerr << "gensounds: cannot read " << argv[1] << "\n";
        return 1;
    }
    const std::string directory = argv[2];
    std::string line;
    int lineNumber = 0;
    int written = 0;
    while (std::getline(list, line)) {
        ++lineNumber;
        const auto hash = line.find('#');
        if (hash != std::string::npos)
            line.erase(hash);
        std::istringstream fields(line);
        std::string name;
        if (!(fields >> name))
            continue;
        std::vector<double> samples;
        std::string token;
        while (fields >> token) {
            Note note {0.0, 0};
            if (std::sscanf(token.c_str(), "%lf:%d", &note.frequency, &note.milliseconds) != 2
                || note.milliseconds <= 0 || note.milliseconds > 5000 || note.frequency < 0.0
                || note.frequency > kRate / 2) {
                std::cerr << argv[1] << ":" << lineNumber << ": bad note '" << token << "'\n";
                return 1;
            }
            render(note, samples);
        }
        if (samples.empty()) {
            std::cerr << argv[1] << ":" << lineNumber << ": " << name << " has no notes\n";
            return 1;
        }
        if (!writeWav(directory + "/" + name, samples)) {
            std::cerr << "gensounds: cannot write " << directory << "/" << name << "\n";
            return 1;
        }
        ++written;
    }
    std::cout << "gensounds: " << written << " sounds in " << directory << "\n";
    return 0;
}
