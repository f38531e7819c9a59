// The built program: the examples and what they print, what surrounds it, and its limits. What it prints in each way of
// asking stands in program.md.
#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <sstream>

namespace {

namespace fs = std::filesystem;

const fs::path kExamples = ZORNET_EXAMPLES;
const std::string kProgram = ZORNET_PROGRAM;

struct Ran {
  int code;
  std::string out;
};

// By way of the shell; standard error comes along only where the arguments say so.
Ran Zornet(const std::string& arguments) {
  FILE* pipe = popen(("'" + kProgram + "' " + arguments).c_str(), "r");
  Ran ran{-1, ""};
  std::array<char, 4096> buffer;
  while (const std::size_t read = std::fread(buffer.data(), 1, buffer.size(), pipe))
    ran.out.append(buffer.data(), read);
  ran.code = WEXITSTATUS(pclose(pipe));
  return ran;
}

std::string Quoted(const fs::path& path) {
  std::string quoted = path.string();
  quoted.insert(quoted.begin(), '\'');
  return quoted += '\'';
}
// Of this run, since others may test at the same time.
fs::path OwnFolder(const std::string& name) {
  return fs::canonical(testing::TempDir()) / (name + '-' + std::to_string(getpid()));
}
std::string Example(const std::string& name) { return Quoted(kExamples / (name + ".szn")); }
Ran RunModel(const std::string& model, const std::string& arguments) {
  return Zornet(arguments + " - <<'END'\n" + model + "\nEND\n");
}

std::string Read(const fs::path& file) {
  std::ifstream in(file);
  std::ostringstream text;
  text << in.rdbuf();
  return text.str();
}

TEST(Program, PrintsWhatTheExamplesExpect) {
  int models = 0;
  for (const auto& entry : fs::directory_iterator(kExamples)) {
    if (entry.path().extension() != ".szn") continue;
    ++models;
    const fs::path expected = fs::path(entry.path()).replace_extension(".expected");
    EXPECT_EQ(Zornet("-q " + Quoted(entry.path()) + " 2>&1").out, Read(expected)) << entry.path();
    const fs::path solutions = fs::path(entry.path()).replace_extension(".solutions");
    if (!fs::exists(solutions)) continue;
    EXPECT_EQ(Zornet("-q --solutions 100 " + Quoted(entry.path()) + " 2>&1").out, Read(solutions)) << entry.path();
  }
  EXPECT_GE(models, 16);
}

// What others make models of: no end, no line end, no memory.
TEST(Program, HugeModels) {
  const Ran endless = Zornet("/dev/zero 2>&1");
  EXPECT_EQ(endless.code, 2);
  EXPECT_EQ(endless.out, "zornet: error: /dev/zero: is larger than 256 MB\n");
  const Ran garbage = Zornet("- 2>&1 <<END\n$(head -c 5000000 /dev/zero | tr '\\0' '#')\nEND\n");
  EXPECT_EQ(garbage.code, 3);
  EXPECT_LT(garbage.out.size(), 20'000u);
#if !defined(__SANITIZE_ADDRESS__) && !defined(__clang__)  // whose shadow of the memory is larger than any limit
  const Ran without = Zornet("-h >/dev/null; ulimit -v 100000; '" + kProgram + "' /dev/zero 2>&1");
  EXPECT_EQ(without.code, 7);
  EXPECT_EQ(without.out, "zornet: error: out of memory\n");
#endif
}

// A dot that ends before it has read its graph.
TEST(Program, PictureThatFails) {
  const fs::path folder = OwnFolder("zornet-dot");
  fs::create_directories(folder);
  std::ofstream(folder / "dot") << "#!/bin/sh\nexit 1\n";
  fs::permissions(folder / "dot", fs::perms::owner_all);
  std::string large;
  for (int i = 0; i < 2000; ++i) large += "var string: v" + std::to_string(i) + ";\n";
  const std::string start = "-h >/dev/null; PATH=" + Quoted(folder) + ":\"$PATH\" '" + kProgram + "' ";
  const Ran drawn = RunModel(large, start + "-q --svg /dev/null 2>&1 >/dev/null");
  EXPECT_EQ(drawn.code, 2);
  EXPECT_EQ(drawn.out, "zornet: error: /dev/null: dot could not draw it\n");
  fs::remove_all(folder);
}

// Copies of the program and of the libraries that it links find no module, unless they are told where to look.
TEST(Program, ModuleNotFound) {
  const fs::path root = OwnFolder("zornet-alone"), bin = root / "bin", lib = root / "lib";
  const fs::path home = fs::path(kProgram).parent_path();
  fs::remove_all(root);
  fs::create_directories(bin);
  fs::create_directories(lib);
  fs::copy_file(kProgram, bin / "zornet");
  for (const fs::path library : {ZORNET_HOST, ZORNET_NETWORK}) fs::copy_file(library, lib / library.filename());
  const std::string start = "-h >/dev/null; LD_LIBRARY_PATH=" + Quoted(lib) + " " + Quoted(bin / "zornet") + " ";
  const Ran alone = Zornet(start + "--module-path /nowhere " + Example("hello") + " 2>&1");
  EXPECT_EQ(alone.code, 4);
  const std::string places = bin.string() + ", /nowhere, " + lib.string() + "\n";
  EXPECT_NE(alone.out.find("libZORVadStrings.so: not found in " + places), std::string::npos) << alone.out;
  EXPECT_EQ(
      Zornet(start + "--module-path /nowhere --module-path " + Quoted(home) + " " + Example("hello") + " 2>&1").code,
      0);
  fs::remove_all(root);
}

// Each operation of each constraint, on operands that tell them apart.
TEST(Program, RawCallsAnswerAsTheModuleDoes) {
  const fs::path model = ZORNET_RAW "/raw.szn", expected = ZORNET_RAW "/raw.expected";
  EXPECT_EQ(Zornet("-q --raw - <" + model.string()).out, Read(expected));
}

TEST(Program, Colours) {
  const auto coloured = [](const Ran& ran) { return ran.code == 0 && ran.out.find('\x1b') != std::string::npos; };
  const std::string hello = "-q " + Example("hello");
  EXPECT_FALSE(coloured(Zornet(hello)));
  EXPECT_TRUE(coloured(Zornet("--color=always " + hello)));
  const struct {
    const char *before, *options;
    bool coloured;
  } onTerminal[] = {{"", "", true}, {"NO_COLOR=", "", true}, {"NO_COLOR=1", "", false}, {"", "--color=never", false}};
  for (const auto& row : onTerminal) {
    const std::string command = row.before + (" '" + kProgram + "' ") + row.options + ' ' + hello;
    EXPECT_EQ(coloured(Zornet("-h >/dev/null; env -u NO_COLOR script -qec \"" + command + "\" /dev/null")),
              row.coloured)
        << command;
  }
}

}  // namespace
