// EXIF reading in one process: exif_bench ROUNDS FILE...
// Prints the mean time of one ReadExif plus BuildExifReport.

#include "pictures/exif_info.h"
#include "pictures/exif_report.h"

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <vector>

int main(int argc, char** argv)
{
    if (argc < 3) {
        std::fprintf(stderr, "usage: exif_bench ROUNDS FILE...\n");
        return 1;
    }
    const int rounds = std::atoi(argv[1]);
    const std::vector<std::string> files(argv + 2, argv + argc);
    size_t reports = 0;
    const auto start = std::chrono::steady_clock::now();
    for (int r = 0; r < rounds; ++r) {
        for (const std::string& file : files) {
            CExifInfo info;
            info.ReadExif(file);
            if (info.exifRead)
                reports += BuildExifReport(info).size();
        }
    }
    const std::chrono::duration<double, std::micro> spent =
        std::chrono::steady_clock::now() - start;
    std::printf("files %zu\nrounds %d\nmicroseconds_per_file %.1f\nreport_bytes %zu\n",
                files.size(), rounds, spent.count() / (double(rounds) * files.size()),
                reports / size_t(rounds > 0 ? rounds : 1));
    return 0;
}
