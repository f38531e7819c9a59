// The built program: the examples and what they print, exit codes, and each way of asking.
#include <gtest/gtest.h>
#include <sys/wait.h>

#include <array>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <nlohmann/json.hpp>
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

const char kMany[] = "var 0..999: a; var 0..999: b; var 0..999: c;";  // more solutions than anybody waits for

TEST(Program, ExitCodes) {
  EXPECT_EQ(Zornet(Example("hello") + " 2>&1").code, 0);
  EXPECT_EQ(Zornet(Quoted(kExamples / "hello") + " 2>&1").code, 0);
  EXPECT_EQ(Zornet(Example("clash") + " 2>&1").code, 1);
  EXPECT_EQ(RunModel("var {\"a\", \"b\"}: x; var {\"a\", \"b\"}: y; var {\"a\", \"b\"}: z;"
                     "constraint str_ne(x, y); constraint str_ne(y, z); constraint str_ne(x, z);",
                     "--solutions 1 2>&1")
                .code,
            1);
  EXPECT_EQ(Zornet("2>&1").code, 2);
  EXPECT_EQ(Zornet("--no-such-option x 2>&1").code, 2);
  EXPECT_EQ(Zornet("/no/such/file 2>&1").code, 2);
  EXPECT_EQ(Zornet(Quoted(kExamples) + " 2>&1").code, 2);
  EXPECT_EQ(Zornet("--explain nobody " + Example("hello") + " 2>&1").code, 2);
  EXPECT_EQ(Zornet("--dot /no/such/folder/x " + Example("hello") + " 2>&1").code, 2);
  EXPECT_EQ(Zornet("--raw --explain host " + Example("hello") + " 2>&1").code, 2);
  EXPECT_EQ(RunModel("var x;", "2>&1").code, 3);
  EXPECT_EQ(Zornet("--step-limit 1 " + Example("hello") + " 2>&1").code, 5);
  EXPECT_EQ(Zornet("--help 2>&1").code, 0);
  for (const char* arguments : {"", "--help", "--json-stream", "--solutions 1000000000"})
    EXPECT_EQ(RunModel(kMany, std::string(arguments) + " 2>/dev/null >/dev/full").code, 2) << arguments;
  EXPECT_EQ(Zornet(Example("hello") + " 2>/dev/null >&-").code, 2);
  EXPECT_EQ(Zornet("--version").code, 0);
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

TEST(Program, GraphsOnStandardOutput) {
  EXPECT_NE(Zornet("-q --dot - " + Example("hello")).out.find("\ndigraph network {"), std::string::npos);
  EXPECT_NE(Zornet("-q --svg - " + Example("hello")).out.find("\n<svg "), std::string::npos);
  EXPECT_FALSE(fs::exists("-"));
}

TEST(Program, NumbersAreWholeAndNotNegative) {
  for (const char* option : {"--budget -1", "--step-limit=-5", "--solutions -1", "--solutions 0", "--budget 1e3"}) {
    const Ran ran = Zornet(option + (" " + Example("hello")) + " 2>&1");
    EXPECT_EQ(ran.code, 2) << option;
    EXPECT_NE(ran.out.find(": expected a whole number from "), std::string::npos) << ran.out;
  }
}

TEST(Program, ReadersThatEndEarly) {
  const fs::path folder = fs::path(testing::TempDir()) / "zornet-dot";
  fs::create_directories(folder);
  std::ofstream(folder / "many.szn") << kMany;
  EXPECT_EQ(Zornet("-q --solutions 1000000000 " + Quoted(folder / "many.szn") + " | head -1").out, "a = 0\n");

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

// Copies of the program and the host library find no module, unless they are told where to look.
TEST(Program, ModuleNotFound) {
  const fs::path root = fs::canonical(testing::TempDir()) / "zornet-alone", bin = root / "bin", lib = root / "lib";
  const fs::path home = fs::path(kProgram).parent_path(), host = ZORNET_HOST;
  fs::remove_all(root);
  fs::create_directories(bin);
  fs::create_directories(lib);
  fs::copy_file(kProgram, bin / "zornet");
  fs::copy_file(host, lib / host.filename());
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

TEST(Program, Trace) {
  const Ran ran = RunModel("var {\"a\", \"b\"}: x;\nconstraint  str_ne( x,\n  \"b\" ); % not b", "-q --trace");
  EXPECT_EQ(ran.out, "<stdin>:2: str_ne( x, \"b\" )  x: { \"a\", \"b\" } -> \"a\" (CalcUnequalValue)\nx = \"a\"\n");
}

TEST(Program, ExplainTellsTheChainAndNothingElse) {
  const Ran ran = RunModel(
      "var string: a = \"x\"; var string: b; var string: c;\nvar string: far = \"y\"; var string: other;\n"
      "constraint str_upper(a, b);\nconstraint str_upper(far, other);\nconstraint str_concat(b, \"!\", c);\noutput c;",
      "-q --explain c");
  EXPECT_EQ(ran.out,
            "c = \"X!\"\nc is \"X!\", since\n  <stdin>:1: a was declared as \"x\"\n"
            "  <stdin>:3: str_upper(a, b)  b: Any -> \"X\" (CalcUpperValue)\n"
            "  <stdin>:5: str_concat(b, \"!\", c)  c: Any -> \"X!\" (CalcConcatenation)\n");
}

// Whether a contradiction shows before the first choice or behind the last.
TEST(Program, SearchesEndInOneWay) {
  for (const char* model : {"var {\"a\"}: x; var {\"a\"}: y; constraint str_ne(x, y);",
                            "var {\"a\", \"b\"}: x; var {\"a\", \"b\"}: y; var {\"a\", \"b\"}: z;"
                            "constraint str_ne(x, y); constraint str_ne(y, z); constraint str_ne(x, z);"}) {
    const Ran text = RunModel(model, "--solutions 5 2>/dev/null");
    EXPECT_EQ(text.out, "==========\n");
    EXPECT_EQ(text.code, 1);
    std::string last = RunModel(model, "--json-stream --solutions 5").out;
    last.erase(0, last.rfind("{\"event\":\"summary\""));
    const auto summary = nlohmann::json::parse(last);
    EXPECT_EQ(summary["outcome"], "contradiction");
    EXPECT_EQ(summary["solutions"], 0);
    EXPECT_EQ(summary["complete"], true);
  }
  const char open[] = "var string: x; var {\"p\", \"q\"}: y; constraint str_ne(x, y);";
  const Ran text = RunModel(open, "-q --solutions 5 2>&1");
  EXPECT_EQ(text.out, "unknown: x stays open\n");
  EXPECT_EQ(text.code, 6);
  EXPECT_NE(RunModel(open, "--json-stream --solutions 5").out.find("\"complete\":false,\"open\":2,\"variable\":\"x\""),
            std::string::npos);
  const Ran stopped = RunModel("var {\"a\", \"b\"}: x; var {\"a\", \"b\", \"c\"}: y; constraint str_ne(x, y);",
                               "--solutions 9 --step-limit 7 2>&1");
  EXPECT_NE(stopped.out.find("step limit reached after 2 solutions;"), std::string::npos) << stopped.out;
  EXPECT_EQ(stopped.code, 5);
}

TEST(Program, ChoicesExplainNothing) {
  EXPECT_EQ(RunModel("var {\"a\", \"b\", \"c\"}: x;\nconstraint str_ne(x, \"c\");", "-q --solutions 1 --explain x").out,
            "x = \"a\"\n----------\nx is { \"a\", \"b\" }, since\n"
            "  <stdin>:1: x was declared as { \"a\", \"b\", \"c\" }\n"
            "  <stdin>:2: str_ne(x, \"c\")  x: { \"a\", \"b\", \"c\" } -> { \"a\", \"b\" } (CalcUnequalValue)\n");
}

// Each operation of each constraint, on operands that tell them apart.
TEST(Program, RawCallsAnswerAsTheModuleDoes) {
  const fs::path model = ZORNET_RAW "/raw.szn", expected = ZORNET_RAW "/raw.expected";
  EXPECT_EQ(Zornet("-q --raw - <" + model.string()).out, Read(expected));
}

TEST(Program, Summary) {
  EXPECT_NE(Zornet(Example("clash") + " 2>&1 >/dev/null").out.find("contradiction at "), std::string::npos);
  EXPECT_NE(Zornet(Example("clash") + " 2>&1 >/dev/null")
                .out.find(":10: str_eq(found, archive) leaves nothing for found; 3 constraints"),
            std::string::npos);
  EXPECT_TRUE(Zornet(Example("hello") + " 2>&1 >/dev/null").out.starts_with("settled; 5 constraints, "));
  const char two[] = "var {\"a\", \"b\"}: x; output x;";
  EXPECT_TRUE(RunModel(two, "--solutions 9 2>&1 >/dev/null").out.starts_with("all 2 solutions; "));
  const Ran stopped = RunModel(two, "--solutions 1 2>&1 >/dev/null");
  EXPECT_TRUE(stopped.out.starts_with("1 solution found, there may be more; ")) << stopped.out;
  EXPECT_EQ(stopped.code, 0);
}

TEST(Program, JsonStream) {
  std::istringstream lines(Zornet("--json-stream --stats --explain machine " + Example("hello")).out);
  std::map<std::string, int> events;
  nlohmann::json last;
  for (std::string line; std::getline(lines, line);) {
    last = nlohmann::json::parse(line);
    ++events[last["event"]];
    if (last["event"] != "variable" || last["name"] != "machine") continue;
    EXPECT_EQ(last["texts"], nlohmann::json::array({"north-7"}));
  }
  EXPECT_EQ(events["variable"], 7);
  EXPECT_EQ(events["narrowing"], 5);
  EXPECT_EQ(events["explanation"], 1);
  EXPECT_EQ(events["operation"], 5);
  EXPECT_EQ(last["event"], "summary");
  EXPECT_EQ(last["outcome"], "settled");
  const auto error = nlohmann::json::parse(RunModel("var x;", "--json-stream").out);
  EXPECT_EQ(error["event"], "error");
  EXPECT_EQ(error["column"], 5);
  EXPECT_EQ(error["length"], 1);
}

TEST(Program, Colours) {
  const std::string hello = Example("hello");
  EXPECT_EQ(Zornet("-q " + hello).out.find('\x1b'), std::string::npos);
  EXPECT_NE(Zornet("-q --color=always " + hello).out.find('\x1b'), std::string::npos);
  EXPECT_EQ(Zornet("-q --color=never " + hello).out.find('\x1b'), std::string::npos);
}

TEST(Program, PartsOfASplitHaveTheSolutionsOfTheWhole) {
  const fs::path folder = fs::path(testing::TempDir()) / "zornet-split";
  const auto solutions = [](const std::string& file) {
    std::multiset<std::string> found;
    std::istringstream lines(Zornet("-q --json-stream --solutions 100000 " + file).out);
    for (std::string line; std::getline(lines, line);) {
      const auto event = nlohmann::json::parse(line);
      if (event["event"] == "solution") found.insert(event["values"].dump());
    }
    return found;
  };
  for (const char* example : {"plates", "shelves", "logins"}) {
    fs::create_directories(folder);
    std::istringstream files(Zornet("--split 3 --parts " + Quoted(folder / "part") + " " + Example(example)).out);
    std::multiset<std::string> merged;
    std::size_t parts = 0;
    for (std::string file; std::getline(files, file); ++parts) merged.merge(solutions(Quoted(file)));
    EXPECT_GE(parts, 3U) << example;
    EXPECT_EQ(merged, solutions(Example(example))) << example;
    fs::remove_all(folder);
  }
}

TEST(Program, Graph) {
  const std::string graph = Zornet("-q --dot - " + Example("clash")).out;
  EXPECT_NE(graph.find("<b>found</b><br/>Nil"), std::string::npos);
  EXPECT_NE(graph.find("color=\"#b3261e\", penwidth=2, label=<<b>found</b>"), std::string::npos);
  EXPECT_NE(graph.find("fontcolor=\"#b3261e\", penwidth=2, label=\"str_eq\""), std::string::npos);

  const std::string folded = Zornet("-q --explain label --dot - " + Example("hello")).out;
  EXPECT_NE(folded.find("v0 -> v2"), std::string::npos);
  EXPECT_NE(folded.find("label=\"str_concat(\u00b7, \\\"-\\\")\""), std::string::npos);
  EXPECT_EQ(folded.find("<b>banner</b>"), std::string::npos);
}

}  // namespace
