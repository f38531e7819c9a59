// Models: any text is a model or is answered with errors, and a model is narrowed, searched and told about.
#include <fmt/format.h>

#include <nlohmann/json.hpp>
#include <sstream>

#include "fuzz/support.h"
#include "language/reader.h"
#include "zornet/graph.h"
#include "zornet/raw.h"
#include "zornet/report.h"

namespace {

using namespace zornet;

constexpr Limits kLimits{64, 500};
constexpr std::uint64_t kSolutions = 3;
constexpr std::size_t kVariables = 1000;  // more take arrays, and too long

// Every file that a model names is the model itself.
struct SameFiles : Files {
  explicit SameFiles(std::string model) : text(std::move(model)) {}
  std::string Read(const std::string&) const override { return text; }
  std::string text;
};

// A model that is one, made by the choices in bytes: a few variables of every type, and any constraints on them.
class Grown {
 public:
  explicit Grown(zor::fuzz::Bytes bytes) : mBytes(bytes) {
    for (std::size_t more = 2 + mBytes.Below(7); more > 0; --more) {
      const auto& [type, sort] = kTypes[mBytes.Below(std::size(kTypes))];
      text += fmt::format("var {}: v{};\n", type, mSorts.size());
      mSorts.push_back(sort);
    }
    while (!mBytes.Ended()) Constrain(Kinds()[mBytes.Below(Kinds().size())]);
  }
  std::string text;

 private:
  static constexpr std::pair<const char*, Sort> kTypes[] = {{"string", Sort::Text},
                                                            {"string", Sort::Text},
                                                            {"set string", Sort::TextSet},
                                                            {"{\"a\", \"Ab\", \"\", \"b a\"}", Sort::TextSet},
                                                            {"int", Sort::Integer},
                                                            {"0..3", Sort::Interval},
                                                            {"-2147483648..2147483647", Sort::Interval},
                                                            {"{1, 2, 300}", Sort::IntegerSet},
                                                            {"bool", Sort::Boolean}};
  static constexpr const char* kTexts[] = {"\"a\"", "\"\"", "\"aAb\"", "\" \"", "\"z\\\"z\""};
  static constexpr const char* kTruths[] = {"true", "false"};
  static constexpr const char* kExpressions[] = {"\"a*b?\"", "\"[^a]{1,3}|A.\"", "\"(a|ab)+\"", "\"\\\\d*\""};

  template <std::size_t kCount>
  std::string OneOf(const char* const (&choices)[kCount]) {
    return choices[mBytes.Below(kCount)];
  }
  std::string Row() { return fmt::format("{}, {}", OneOf(kTexts), OneOf(kTexts)); }
  std::string Argument(Takes takes) {
    if (takes == Takes::Expression) return OneOf(kExpressions);
    if (takes == Takes::Rows) return fmt::format("[|{}|{}|]", Row(), Row());
    const std::size_t variable = mBytes.Below(mSorts.size());
    if (Fits(mSorts[variable], takes) && mBytes.Below(4) != 0) return fmt::format("v{}", variable);
    if (takes == Takes::Boolean) return OneOf(kTruths);
    return takes == Takes::Integer ? std::to_string(static_cast<int>(mBytes.Below(9)) - 2) : OneOf(kTexts);
  }
  std::string List(Takes takes) {
    std::string list = Argument(MemberOf(takes));
    for (std::size_t more = 1 + mBytes.Below(3); more > 0; --more) list += ", " + Argument(MemberOf(takes));
    return fmt::format("[{}]", list);
  }
  void Constrain(const Kind& kind) {
    std::string arguments;
    for (int i = 0; i < kind.arity; ++i) {
      const Takes takes = kind.takes[static_cast<std::size_t>(i)];
      arguments += fmt::format("{}{}", i == 0 ? "" : ", ", IsList(takes) ? List(takes) : Argument(takes));
    }
    text += fmt::format("constraint {}({});\n", kind.name, arguments);
  }

  zor::fuzz::Bytes mBytes;
  std::vector<Sort> mSorts;  // of the variables
};

// Tells report all there is to tell of a model: bare calls, what is narrowed, explanations and solutions.
Summary Tell(const Source& source, const ReadModel& read, Report& report, bool traces) {
  static const Network kKeepsModulesLoaded{Model()};
  const Names names(source, read.places, read.model);
  Network bare(read.model, kLimits), network(read.model, kLimits);
  RunRaw(bare, names, [&](const RawCall& call) { report.Called(call); });
  if (traces) network.OnNarrowing([&](const Narrowing& narrowing) { report.Narrowed(narrowing); });
  Summary summary;
  summary.outcome = network.Narrow();
  report.Variables(network);
  for (int v = 0; v < static_cast<int>(read.model.Variables().size()); ++v)
    report.Explain(network, {v}, network.Explain({v}));
  std::uint64_t solutions = 0;
  summary.search = network.Search(kSolutions, [&] {
    report.Solution(network, ++solutions);
    return true;
  });
  summary.outcome = summary.search->outcome;
  report.Statistics(network);
  Graph(network, names);
  report.Finish(network, summary);
  return summary;
}

void CheckObjects(std::istringstream lines) {
  for (std::string line; std::getline(lines, line);)
    if (!nlohmann::json::accept(line)) zor::fuzz::Fail("no JSON: " + line);
}

}  // namespace

// With a listener or without, the outcome is the same. Behind a zero byte stand the choices of a model.
int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const bool grown = size > 0 && data[0] == 0;
  const SameFiles files(grown ? Grown({data + 1, size - 1}).text : std::string(data, data + size));
  Source source("fuzz.szn", files.text);
  Diagnostics diagnostics;
  const ReadModel read = Read(source, diagnostics, files);
  if (read.model.Variables().size() > kVariables) return 0;
  std::ostringstream objects, results, remarks;
  const auto json = MakeJsonReport(source, read.places, read.model, objects);
  const auto text = MakeTextReport(source, read.places, read.model, {true, true, false}, results, remarks);
  if (diagnostics.Failed()) {
    for (Report* report : {json.get(), text.get()}) report->Errors(source, diagnostics);
  } else {
    const Summary traced = Tell(source, read, *text, true), plain = Tell(source, read, *json, false);
    const bool isSame = traced.outcome == plain.outcome && traced.search->solutions == plain.search->solutions;
    if (!isSame) zor::fuzz::Fail("another outcome when it is traced");
  }
  CheckObjects(std::istringstream(objects.str()));
  return 0;
}
