// Runs a libFuzzer-style target without libFuzzer: every file named on the
// command line is one input, then `-runs=N` random inputs (default 1000) of
// up to 1.5 KiB, biased towards UTF-8 and markup so the text paths are reached.
// The seed is printed so that a failing run can be repeated (-seed=S).
// CONTACTS_FUZZ_RUNS, when set, overrides -runs (the long test mode).
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <iterator>
#include <random>
#include <string>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size);

namespace {

const char* const kPieces[] = {
	"<br/>", "&amp;", "&lt;", "<b>", "</b>", "\xC3\xA9", "\xE2\x82\xAC", "\xF0\x9F\x98\x80",
	"\xED\xA0\x80", "\xC0", "\xFF", "+", "-", "(", ")", " ", ",", ";", "p", "w", "/", ".",
	"\xD9\xA3", "*", "#", "\n", "%", "\"",
};

std::vector<uint8_t> randomInput(std::mt19937& rng)
{
	std::vector<uint8_t> input;
	size_t target = rng() % 1500;
	while (input.size() < target) {
		if (rng() % 3 == 0) {
			const char* piece = kPieces[rng() % (sizeof(kPieces) / sizeof(kPieces[0]))];
			input.insert(input.end(), piece, piece + strlen(piece));
		} else {
			input.push_back(static_cast<uint8_t>(rng() % 4 ? '0' + rng() % 75 : rng() % 256));
		}
	}
	return input;
}

bool runFile(const char* path)
{
	std::ifstream in(path, std::ios::binary);
	if (!in) {
		fprintf(stderr, "cannot read %s\n", path);
		return false;
	}
	std::vector<uint8_t> data((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
	LLVMFuzzerTestOneInput(data.data(), data.size());
	return true;
}

} // namespace

int main(int argc, char** argv)
{
	long runs = 1000;
	unsigned long seed = std::random_device()();
	for (int i = 1; i < argc; ++i) {
		if (strncmp(argv[i], "-runs=", 6) == 0)
			runs = strtol(argv[i] + 6, nullptr, 10);
		else if (strncmp(argv[i], "-seed=", 6) == 0)
			seed = strtoul(argv[i] + 6, nullptr, 10);
		else if (argv[i][0] != '-' && !runFile(argv[i]))
			return 1;
	}
	if (const char* longRuns = getenv("CONTACTS_FUZZ_RUNS"))
		runs = strtol(longRuns, nullptr, 10);
	printf("seed %lu, %ld random inputs\n", seed, runs);
	fflush(stdout); // a crash must not lose the seed that repeats it
	std::mt19937 rng(static_cast<std::mt19937::result_type>(seed));
	LLVMFuzzerTestOneInput(nullptr, 0);
	for (long i = 0; i < runs; ++i) {
		std::vector<uint8_t> input = randomInput(rng);
		LLVMFuzzerTestOneInput(input.data(), input.size());
	}
	return 0;
}
