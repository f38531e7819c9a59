#include "zornet/graph.h"

#include <fmt/core.h>

#include <algorithm>
#include <iterator>

namespace zornet {

namespace {

constexpr std::size_t kLineWidth = 34;
constexpr std::size_t kLines = 6;
constexpr std::size_t kLabelWidth = 48;
constexpr std::size_t kMostLayered = 60;  // nodes; layers of more are too wide to be read

constexpr std::string_view kGrey = "#55606e", kBlue = "#3367a8", kRed = "#b3261e";

std::string_view Entity(char c) {
  switch (c) {
    case '&':
      return "&amp;";
    case '<':
      return "&lt;";
    case '>':
      return "&gt;";
    case '"':
      return "&quot;";
    case '\\':
      return "\\\\";
    default:
      return "";
  }
}

// In labels and tooltips alike dot reads entities, and what stands behind a backslash.
std::string Escape(std::string_view text) {
  std::string escaped;
  for (const char c : text) {
    const std::string_view entity = Entity(c);
    entity.empty() ? escaped += c : escaped += entity;
  }
  return escaped;
}

// The first width bytes, or some fewer, so that no character is cut.
std::string_view Head(std::string_view text, std::size_t width) {
  if (text.size() <= width) return text;
  while (width > 0 && (static_cast<unsigned char>(text[width]) & 0xC0) == 0x80) --width;
  return text.substr(0, width);
}

std::string Cut(std::string_view text) {
  const std::string_view head = Head(text, kLabelWidth);
  return std::string(head) + (head.size() < text.size() ? "..." : "");
}

// The members of a printed set, which has commas also in its texts.
std::vector<std::string_view> Members(std::string_view set) {
  std::vector<std::string_view> members;
  bool quoted = false;
  std::size_t begin = 0;
  for (std::size_t i = 0; i <= set.size(); ++i) {
    if (i == set.size() || (!quoted && set[i] == ',')) {
      members.push_back(set.substr(begin, i - begin));
      begin = i + 2;
    } else if (quoted && set[i] == '\\') {
      ++i;
    } else if (set[i] == '"') {
      quoted = !quoted;
    }
  }
  return members;
}

// A long value in lines, each a part of it.
std::string FoldText(std::string_view text) {
  std::string folded;
  for (std::size_t line = 0; !text.empty(); ++line) {
    if (line != 0) folded += "<br/>";
    if (line == kLines) return folded + "...";
    const std::string_view head = Head(text, kLineWidth);
    folded += Escape(head);
    text.remove_prefix(head.size());
  }
  return folded;
}

// A set in lines, broken between its members. Those that would fill the picture are only counted.
std::string FoldSet(std::string_view set) {
  const std::vector<std::string_view> members = Members(set);
  std::string folded = "{ ";
  std::size_t width = 2, lines = 1;
  for (std::size_t i = 0; i < members.size(); ++i) {
    if (width > 2 && width + members[i].size() > kLineWidth) {
      if (lines++ == kLines) return folded + fmt::format("+{} more }}", members.size() - i);
      folded += "<br/>";
      width = 0;
    }
    folded += Escape(Cut(members[i])) + (i + 1 < members.size() ? ", " : " }");
    width += members[i].size() + 2;
  }
  return folded;
}

std::string Fold(std::string_view value) {
  if (value.starts_with("{ ") && value.ends_with(" }")) return FoldSet(value.substr(2, value.size() - 4));
  return FoldText(value);
}

class Drawing {
 public:
  Drawing(const Network& network, const Names& names, const Explanation* explanation);
  std::string Draw();

 private:
  template <class... Arguments>
  void Add(fmt::format_string<Arguments...> format, Arguments&&... arguments) {
    mText += fmt::format(format, std::forward<Arguments>(arguments)...);
  }

  void Show(const Explanation& explanation);
  void DrawVariable(int variable);
  void DrawConstraint(int number);
  void DrawAsNode(int number);
  void DrawAsEdge(int number);
  void DrawEdge(const Constraint& constraint, int number, std::size_t position);
  bool Shows(int variable) const { return mShown[static_cast<std::size_t>(variable)] != 0; }
  bool IsEdge(const Constraint& constraint) const;
  std::size_t CountNodes() const;
  std::string Label(int number, std::size_t arguments) const;
  const Constraint& At(int number) const { return mModel.Constraints()[static_cast<std::size_t>(number)]; }
  std::string_view Line(int number) const { return mNetwork.FailedConstraint() == number ? kRed : kBlue; }

  const Network& mNetwork;
  const Model& mModel;
  const Names& mNames;
  std::vector<char> mShown;  // by variable: whether it is a node; else it stands in the labels of its constraints
  std::vector<char> mDrawn;  // by constraint
  std::string mText;
};

Drawing::Drawing(const Network& network, const Names& names, const Explanation* explanation)
    : mNetwork(network),
      mModel(network.GetModel()),
      mNames(names),
      mShown(mModel.Variables().size(), explanation == nullptr ? 1 : 0),
      mDrawn(mModel.Constraints().size(), explanation == nullptr ? 1 : 0) {
  if (explanation != nullptr) Show(*explanation);
  for (std::size_t v = 0; v < mShown.size(); ++v) {
    if (mModel.Variables()[v].constant) mShown[v] = 0;
  }
}

void Drawing::Show(const Explanation& explanation) {
  for (const Explanation::Start& start : explanation.declared)
    mShown[static_cast<std::size_t>(start.variable.index)] = 1;
  for (const Narrowing& narrowing : explanation.narrowings) {
    mShown[static_cast<std::size_t>(narrowing.variable.index)] = 1;
    if (narrowing.constraint != kNone) mDrawn[static_cast<std::size_t>(narrowing.constraint)] = 1;
  }
}

// Layers show the way from arguments to results. In large networks neighbours are laid out close to each other instead,
// and each part that is connected by itself.
std::string Drawing::Draw() {
  const bool layered = CountNodes() <= kMostLayered;
  Add("digraph network {{\n  {}; bgcolor=white;\n",
      layered ? "rankdir=LR; nodesep=0.25; ranksep=0.45"
              : "layout=sfdp; overlap=prism; overlap_scaling=-3; sep=\"+16\"; "
                "splines=line; pack=24; outputorder=edgesfirst");
  Add("  node [fontname=\"Helvetica\", fontsize=11];\n"
      "  edge [fontname=\"Helvetica\", fontsize=9, color=\"#7a8599\", fontcolor=\"#7a8599\", arrowsize=0.6];\n");
  for (std::size_t v = 0; v < mShown.size(); ++v) {
    if (mShown[v] != 0) DrawVariable(static_cast<int>(v));
  }
  for (std::size_t c = 0; c < mDrawn.size(); ++c) {
    if (mDrawn[c] != 0) DrawConstraint(static_cast<int>(c));
  }
  return mText + "}\n";
}

std::size_t Drawing::CountNodes() const {
  std::size_t nodes = static_cast<std::size_t>(std::count(mShown.begin(), mShown.end(), 1));
  for (std::size_t c = 0; c < mDrawn.size(); ++c) nodes += mDrawn[c] != 0 && !IsEdge(mModel.Constraints()[c]) ? 1 : 0;
  return nodes;
}

std::string_view Fill(const Domain& domain) {
  if (domain.IsNil()) return "#f8c4c0";
  if (domain.IsOne()) return "#d5ecd8";
  return domain.IsKnown() ? "#fdf1cf" : "#f1f3f6";
}

void Drawing::DrawVariable(int variable) {
  const Domain domain = mNetwork[variable];
  const bool nil = domain.IsNil();
  Add("  v{} [shape=box, style=\"rounded,filled\", fillcolor=\"{}\", color=\"{}\", penwidth={}, "
      "label=<<b>{}</b><br/>{}>, tooltip=\"{}\"];\n",
      variable, Fill(domain), nil ? kRed : kGrey, nil ? 2 : 1, Escape(mNames.OfVariable(variable)),
      Fold(domain.Print()), Escape(mNames.DeclarationOf(variable)));
}

bool HasResult(const Constraint& constraint) { return !constraint.kind->IsRelation() || constraint.kind->reified; }

// A function of one variable, whatever constants it takes beside.
bool Drawing::IsEdge(const Constraint& constraint) const {
  if (!HasResult(constraint) || !Shows(constraint.Result())) return false;
  int input = kNone;
  for (const int variable : constraint.arguments.first(constraint.Inputs())) {
    if (!Shows(variable) || variable == input) continue;
    if (input != kNone) return false;
    input = variable;
  }
  return input != kNone;
}

void Drawing::DrawConstraint(int number) {
  if (IsEdge(At(number))) {
    DrawAsEdge(number);
  } else {
    DrawAsNode(number);
  }
}

// The name of the constraint, and its arguments when some are no nodes: those that are stand as a dot.
std::string Drawing::Label(int number, std::size_t arguments) const {
  const Constraint& constraint = At(number);
  if (constraint.expression != nullptr) return Cut(mNames.OfConstraint(number));
  std::string list;
  bool folded = false;
  for (const int variable : constraint.arguments.first(arguments)) {
    list += fmt::format("{}{}", list.empty() ? "" : ", ", Shows(variable) ? "\u00b7" : mNames.OfVariable(variable));
    folded = folded || !Shows(variable);
  }
  const std::string name(constraint.kind->name);
  return folded ? Cut(fmt::format("{}({})", name, list)) : name;
}

void Drawing::DrawAsEdge(int number) {
  const Constraint& constraint = At(number);
  const auto input = std::find_if(constraint.arguments.begin(), constraint.arguments.end(),
                                  [this](int variable) { return Shows(variable); });
  const std::string tooltip = Escape(mNames.OfConstraint(number));
  Add("  v{} -> v{} [color=\"{}\", fontcolor=\"{}\", penwidth={}, label=\"{}\", tooltip=\"{}\", "
      "labeltooltip=\"{}\"];\n",
      *input, constraint.Result(), Line(number), Line(number), Line(number) == kRed ? 2 : 1,
      Escape(Label(number, constraint.Inputs())), tooltip, tooltip);
}

void Drawing::DrawAsNode(int number) {
  const Constraint& constraint = At(number);
  Add("  c{} [shape=ellipse, height=0.3, margin=\"0.05,0.02\", color=\"{}\", fontcolor=\"{}\", penwidth={}, "
      "label=\"{}\", style=filled, fillcolor=white, tooltip=\"{}\"];\n",
      number, Line(number), Line(number), Line(number) == kRed ? 2 : 1,
      Escape(Label(number, constraint.arguments.size())), Escape(mNames.OfConstraint(number)));
  for (std::size_t i = 0; i < constraint.arguments.size(); ++i) {
    if (Shows(constraint.arguments[i])) DrawEdge(constraint, number, i);
  }
}

// A relation has no result but its truth value: it stands between its two sides.
void Drawing::DrawEdge(const Constraint& constraint, int number, std::size_t position) {
  const int variable = constraint.arguments[position];
  const bool relation = constraint.kind->IsRelation();
  const bool result = position == constraint.Inputs() && HasResult(constraint);
  const std::string_view role = constraint.arguments.size() > 2 ? constraint.RoleOf(position) : "";
  if (result || (relation && position == 1)) {
    Add("  c{} -> v{} [label=\"{}\"{}];\n", number, variable, role, result ? "" : ", dir=none");
  } else {
    Add("  v{} -> c{} [label=\"{}\"{}];\n", variable, number, role, relation ? ", dir=none" : "");
  }
}

}  // namespace

std::string Graph(const Network& network, const Names& names, const Explanation* explanation) {
  return Drawing(network, names, explanation).Draw();
}

}  // namespace zornet
