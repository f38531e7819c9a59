#include "zornet/split.h"

#include <fmt/core.h>

#include <deque>
#include <utility>

#include "network/texts.h"

namespace zornet {

namespace {

// A variable and one value of it.
struct Choice {
  Var variable;
  Argument value;
  std::string written;
};
using Choices = std::vector<Choice>;

std::string_view EqualityOf(Sort sort) {
  if (IsText(sort)) return "str_eq";
  return IsInteger(sort) ? "int_eq" : "bool_eq";
}

class Splitter {
 public:
  Splitter(const Model& model, const Limits& limits, const std::vector<std::string>& moduleFolders)
      : mModel(model), mLimits(limits), mFolders(moduleFolders) {
    for (const int variable : model.Wanted()) mVariables.push_back({variable});
    if (!mVariables.empty()) return;
    for (std::size_t v = 0; v < model.Variables().size(); ++v) {
      if (!model.Variables()[v].constant) mVariables.push_back({static_cast<int>(v)});
    }
  }

  std::vector<Part> Run(std::size_t parts);

 private:
  std::vector<Choices> Cut(const Choices& part) const;
  std::size_t SizeOf(const Network& network, Var variable) const;
  Choices ChoicesFor(const Network& network, Var variable) const;
  Sort SortOf(Var variable) const { return mModel.Variables()[static_cast<std::size_t>(variable.index)].sort; }

  const Model& mModel;
  const Limits& mLimits;
  const std::vector<std::string>& mFolders;
  std::vector<Var> mVariables;  // that choices are made for
};

// The oldest part is cut next, so that all are about as deep.
std::vector<Part> Splitter::Run(std::size_t parts) {
  std::deque<Choices> waiting{{}};
  std::vector<Choices> whole;  // cannot be cut
  while (!waiting.empty() && waiting.size() + whole.size() < parts) {
    const Choices part = std::move(waiting.front());
    waiting.pop_front();
    std::vector<Choices> smaller = Cut(part);
    if (smaller.size() == 1 && smaller.front().size() == part.size()) {
      whole.push_back(part);
    } else {
      std::move(smaller.begin(), smaller.end(), std::back_inserter(waiting));
    }
  }
  whole.insert(whole.end(), waiting.begin(), waiting.end());
  std::vector<Part> written;
  for (const Choices& choices : whole) {
    Part& part = written.emplace_back();
    for (const Choice& choice : choices)
      part += fmt::format("constraint {}({}, {});\n", EqualityOf(SortOf(choice.variable)),
                          mModel.NameOf(choice.variable), choice.written);
  }
  return written;
}

// A part for each value of the variable with the fewest; none after a contradiction, itself when there is no such
// variable or the steps are used up.
std::vector<Choices> Splitter::Cut(const Choices& part) const {
  Model model = mModel;
  for (const Choice& choice : part) model.Post(EqualityOf(SortOf(choice.variable)), {choice.variable, choice.value});
  Network network(std::move(model), mLimits, mFolders);
  const Outcome outcome = network.Narrow();
  if (outcome == Outcome::Contradiction) return {};
  if (outcome != Outcome::Settled) return {part};
  Var chosen;
  std::size_t fewest = 0;
  for (const Var variable : mVariables) {
    const std::size_t size = SizeOf(network, variable);
    if (size < 2 || (fewest != 0 && size >= fewest)) continue;
    chosen = variable;
    fewest = size;
  }
  if (fewest == 0) return {part};
  std::vector<Choices> smaller;
  for (Choice& choice : ChoicesFor(network, chosen)) {
    smaller.push_back(part);
    smaller.back().push_back(std::move(choice));
  }
  return smaller;
}

constexpr std::size_t kMostValues = 4096;  // of a variable that is cut

// The number of its values; 0 when they are not known or too many.
std::size_t Splitter::SizeOf(const Network& network, Var variable) const {
  const Domain domain = network[variable];
  const Sort sort = SortOf(variable);
  if (sort == Sort::Boolean) return domain.IsOne() ? 1 : 2;
  if (!domain.IsKnown()) return 0;
  if (IsText(sort)) return domain.Texts().size();
  if (sort == Sort::IntegerSet) return domain.Numbers().size();
  const std::int64_t size = std::int64_t{domain.Highest()} - domain.Lowest() + 1;
  return size <= static_cast<std::int64_t>(kMostValues) ? static_cast<std::size_t>(size) : 0;
}

Choices Splitter::ChoicesFor(const Network& network, Var variable) const {
  const Domain domain = network[variable];
  const Sort sort = SortOf(variable);
  Choices choices;
  const auto add = [&](std::int32_t number) { choices.push_back({variable, number, std::to_string(number)}); };
  if (IsText(sort)) {
    for (const std::string& text : domain.Texts()) choices.push_back({variable, text, Quoted(text)});
  } else if (sort == Sort::Boolean) {
    for (const bool truth : {false, true}) choices.push_back({variable, truth, truth ? "true" : "false"});
  } else if (sort == Sort::IntegerSet) {
    for (const std::int32_t number : domain.Numbers()) add(number);
  } else {
    for (std::int64_t n = domain.Lowest(); n <= domain.Highest(); ++n) add(static_cast<std::int32_t>(n));
  }
  return choices;
}

}  // namespace

std::vector<Part> Split(const Model& model, const Limits& limits, const std::vector<std::string>& moduleFolders,
                        std::size_t parts) {
  return Splitter(model, limits, moduleFolders).Run(parts);
}

}  // namespace zornet
