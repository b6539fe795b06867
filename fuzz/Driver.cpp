// Runs a fuzz target without a fuzzing engine: over the files of a corpus as they are, then over changed
// copies of them. The same seed gives the same inputs. An input that ends the process, or takes too long, is
// kept in a file.
#include <algorithm>
#include <chrono>
#include <csignal>
#include <cstring>
#include <fcntl.h>
#include <filesystem>
#include <fstream>
#include <fuzz/FuzzTarget.h>
#include <iostream>
#include <iterator>
#include <random>
#include <string>
#include <unistd.h>
#include <vector>

extern "C" void __sanitizer_set_death_callback(void (*callback)()) __attribute__((weak));

namespace {

using Input = std::vector<std::uint8_t>;

constexpr std::size_t kLargestInput = 64 * 1024;
constexpr unsigned kSecondsPerInput = 10;

struct Options {
  std::vector<std::filesystem::path> places;
  unsigned long runs = 4000;
  double seconds = 5;
  unsigned long seed = 1;
};

// What runs at the moment; read when the process dies.
Input currentInput;
std::string keepAt;

// Only calls that are allowed while a signal is handled.
void keepInput() {
  const int file = ::open(keepAt.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
  if (file < 0) {
    return;
  }
  std::size_t written = 0;
  while (written < currentInput.size()) {
    const ssize_t count = ::write(file, currentInput.data() + written, currentInput.size() - written);
    if (count <= 0) {
      break;
    }
    written += static_cast<std::size_t>(count);
  }
  ::close(file);
  static const char kMessage[] = "fuzz: the input is kept beside the program\n";
  [[maybe_unused]] const ssize_t ignored = ::write(STDERR_FILENO, kMessage, sizeof kMessage - 1);
}

void endBySignal(int signal) {
  keepInput();
  ::signal(signal, SIG_DFL);
  ::raise(signal);
}

void runTarget(const Input& input) {
  currentInput = input;
  ::alarm(kSecondsPerInput);
  LLVMFuzzerTestOneInput(currentInput.data(), currentInput.size());
  ::alarm(0);
}

std::vector<Input> readCorpus(const std::vector<std::filesystem::path>& places) {
  std::vector<std::filesystem::path> files;
  for (const std::filesystem::path& place : places) {
    if (std::filesystem::is_directory(place)) {
      for (const auto& entry : std::filesystem::recursive_directory_iterator(place)) {
        if (entry.is_regular_file()) {
          files.push_back(entry.path());
        }
      }
    } else {
      files.push_back(place);
    }
  }
  std::sort(files.begin(), files.end());
  std::vector<Input> corpus;
  for (const std::filesystem::path& file : files) {
    std::ifstream stream(file, std::ios::binary);
    if (!stream) {
      std::cerr << file << " cannot be read\n";
      return {};
    }
    corpus.emplace_back(std::istreambuf_iterator<char>(stream), std::istreambuf_iterator<char>());
  }
  return corpus;
}

class Mutator {
 public:
  Mutator(const std::vector<Input>& corpus, unsigned long seed) : m_corpus(corpus), m_random(seed) {}

  Input next() {
    Input input = m_corpus[below(m_corpus.size())];
    for (std::size_t change = 1 + below(6); change > 0; --change) {
      changeOnce(input);
    }
    if (input.size() > kLargestInput) {
      input.resize(kLargestInput);
    }
    return input;
  }

 private:
  std::size_t below(std::size_t end) { return end == 0 ? 0 : m_random() % end; }

  void changeOnce(Input& input) {
    const std::size_t at = below(input.size() + 1);
    const std::size_t length = below(std::min<std::size_t>(input.size() - at, 64) + 1);
    const auto place = input.begin() + static_cast<std::ptrdiff_t>(at);
    switch (below(6)) {
      case 0:  // another byte
        if (at < input.size()) {
          *place = static_cast<std::uint8_t>(m_random());
        }
        return;
      case 1:  // a byte that means something to most parsers
        input.insert(place,
                     static_cast<std::uint8_t>("\"'<>{}[]()$@\\%,;:=# \n\r\t\0\xff\xc3\xed"[below(27)]));
        return;
      case 2:  // less
        input.erase(place, place + static_cast<std::ptrdiff_t>(length));
        return;
      case 3: {  // the same again and again
        const Input piece(place, place + static_cast<std::ptrdiff_t>(length));
        Input repeated;
        for (std::size_t times = 1 + below(64); times > 0; --times) {
          repeated.insert(repeated.end(), piece.begin(), piece.end());
        }
        input.insert(place, repeated.begin(), repeated.end());
        return;
      }
      case 4: {  // a piece of another input
        const Input& other = m_corpus[below(m_corpus.size())];
        const std::size_t from = below(other.size() + 1);
        const std::size_t count = below(std::min<std::size_t>(other.size() - from, 256) + 1);
        const auto first = other.begin() + static_cast<std::ptrdiff_t>(from);
        input.insert(place, first, first + static_cast<std::ptrdiff_t>(count));
        return;
      }
      default:  // cut short
        if (below(8) == 0) {
          input.resize(at);
        }
    }
  }

  const std::vector<Input>& m_corpus;
  std::mt19937_64 m_random;
};

bool parse(int argc, char** argv, Options& options) {
  for (int i = 1; i < argc; ++i) {
    const std::string argument = argv[i];
    if (argument.rfind("--", 0) != 0) {
      options.places.emplace_back(argument);
      continue;
    }
    if (i + 1 == argc) {
      return false;
    }
    const char* const value = argv[++i];
    if (argument == "--runs") {
      options.runs = std::strtoul(value, nullptr, 10);
    } else if (argument == "--seconds") {
      options.seconds = std::strtod(value, nullptr);
    } else if (argument == "--seed") {
      options.seed = std::strtoul(value, nullptr, 10);
    } else {
      return false;
    }
  }
  return !options.places.empty();
}

}  // namespace

int main(int argc, char** argv) {
  Options options;
  if (!parse(argc, argv, options)) {
    std::cerr << "usage: " << argv[0] << " [--runs N] [--seconds S] [--seed N] FILE|FOLDER...\n";
    return 2;
  }
  const std::vector<Input> corpus = readCorpus(options.places);
  if (corpus.empty()) {
    std::cerr << "there is no input to begin with\n";
    return 3;
  }
  keepAt = std::string(argv[0]) + ".input";
  if (__sanitizer_set_death_callback != nullptr) {
    __sanitizer_set_death_callback(keepInput);
  }
  for (const int signal : {SIGABRT, SIGALRM}) {
    ::signal(signal, endBySignal);
  }

  for (const Input& input : corpus) {
    runTarget(input);
  }
  Mutator mutator(corpus, options.seed);
  const auto start = std::chrono::steady_clock::now();
  const auto spent = [&] {
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
  };
  unsigned long run = 0;
  for (; run < options.runs && spent() < options.seconds; ++run) {
    runTarget(mutator.next());
  }
  std::cout << corpus.size() << " files, " << run << " changed copies, " << spent() << " s\n";
  return 0;
}
