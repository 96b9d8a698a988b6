// Writes a CSV file of N records in ten mixed columns to standard output, the same for the same N everywhere:
// mirel-bench-data 1000000 > rows.csv
#include <array>
#include <cinttypes>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <random>

namespace {

constexpr std::array kNames = {"Turkey vulture", "Rock pigeon",  "Mourning dove", "American kestrel",
                               "Herring gull",   "Barn swallow", "Canada goose",  "European starling",
                               "Horned lark",    "Killdeer"};
constexpr std::array kPlaces = {"Dallas/Fort Worth",
                                "San José",
                                "Zürich",
                                "LaGuardia, NY",
                                "O'Hare",
                                "Denver",
                                "Kraków",
                                "Oslo",
                                "Perth",
                                "Québec"};
constexpr std::array kWords = {"engine",    "runway", "flock",  "approach", "climb", "windshield",
                               "inspected", "light",  "damage", "none",     "seen",  "by",
                               "the",       "tower",  "at",     "dusk"};

class Rows {
public:
    void Write(int64_t number)
    {
        std::printf("%" PRId64 ",%s,\"%s\",%d,%.2f,", number, Pick(kNames), Pick(kPlaces), Below(100000),
                    Below(1000000) / 100.0);
        std::printf("%04d-%02d-%02d,%04d-%02d-%02d %02d:%02d:%02d,%d,", 1990 + Below(30), 1 + Below(12),
                    1 + Below(28), 1990 + Below(30), 1 + Below(12), 1 + Below(28), Below(24), Below(60), Below(60),
                    Below(2));
        std::printf("%05d,\"", Below(100000));
        const int words = 5 + Below(9);
        for (int i = 0; i < words; ++i)
            std::printf("%s%s", i == 0 ? "" : " ", Pick(kWords));
        std::printf("\"\n");
    }

private:
    int Below(uint32_t end) { return int(random_() % end); } // std's distributions differ between libraries
    template <size_t n>
    const char* Pick(const std::array<const char*, n>& texts)
    {
        return texts[random_() % n];
    }

    std::mt19937 random_{20011024};
};

} // namespace

int main(int argc, char** argv)
{
    const int64_t records = argc > 1 ? std::strtoll(argv[1], nullptr, 10) : 1'000'000;
    std::puts("Number,Species,Airport,Cost,Weight,Reported,Happened,Damage,ZIP,Remarks");
    Rows rows;
    for (int64_t i = 1; i <= records; ++i)
        rows.Write(i);
    return std::ferror(stdout) != 0 ? 1 : 0;
}
