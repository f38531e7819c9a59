#include "zornet/graph.h"

#include <fmt/core.h>

#include <algorithm>

namespace zornet {

namespace {

constexpr std::size_t kLineWidth = 34;
constexpr std::size_t kLines = 6;

std::string Escape(std::string_view text) {
  std::string escaped;
  for (const char c : text) {
    if (c == '&')
      escaped += "&amp;";
    else if (c == '<')
      escaped += "&lt;";
    else if (c == '>')
      escaped += "&gt;";
    else if (c == '"')
      escaped += "&quot;";
    else
      escaped += c;
  }
  return escaped;
}

// A long value in lines, broken behind a comma where there is one, and cut where it would fill the picture.
std::string Fold(std::string_view text) {
  std::string folded;
  for (std::size_t line = 0; !text.empty(); ++line) {
    if (line != 0) folded += "<br/>";
    if (line == kLines) return folded + "...";
    std::size_t width = std::min(kLineWidth, text.size());
    const std::size_t comma = width < text.size() ? text.substr(0, width).rfind(", ") : std::string_view::npos;
    if (comma != std::string_view::npos && comma != 0) width = comma + 2;
    folded += Escape(text.substr(0, width));
    text.remove_prefix(width);
  }
  return folded;
}

class Drawing {
 public:
  Drawing(const Network& network, const Names& names) : mNetwork(network), mModel(network.GetModel()), mNames(names) {}

  std::string Draw() {
    Add("digraph network {{\n  rankdir=LR; nodesep=0.25; ranksep=0.45; bgcolor=white;\n"
        "  node [fontname=\"Helvetica\", fontsize=11];\n"
        "  edge [fontname=\"Helvetica\", fontsize=9, color=\"#7a8599\", fontcolor=\"#7a8599\", arrowsize=0.6];\n");
    for (std::size_t v = 0; v < mModel.Variables().size(); ++v) DrawVariable(static_cast<int>(v));
    for (std::size_t c = 0; c < mModel.Constraints().size(); ++c) DrawConstraint(static_cast<int>(c));
    return mText + "}\n";
  }

 private:
  template <class... Arguments>
  void Add(fmt::format_string<Arguments...> format, Arguments&&... arguments) {
    mText += fmt::format(format, std::forward<Arguments>(arguments)...);
  }

  void DrawVariable(int variable);
  void DrawConstraint(int number);
  void DrawEdge(const Constraint& constraint, int number, std::size_t position);
  std::string_view Fill(const Domain& domain) const;

  const Network& mNetwork;
  const Model& mModel;
  const Names& mNames;
  std::string mText;
};

std::string_view Drawing::Fill(const Domain& domain) const {
  if (domain.IsNil()) return "#f8c4c0";
  if (domain.IsOne()) return "#d5ecd8";
  return domain.IsKnown() ? "#fdf1cf" : "#f1f3f6";
}

void Drawing::DrawVariable(int variable) {
  const Domain domain = mNetwork[variable];
  const bool nil = domain.IsNil();
  if (mModel.Variables()[static_cast<std::size_t>(variable)].constant) {
    Add("  v{} [shape=plain, fontcolor=\"{}\", label=<{}>];\n", variable, nil ? "#b3261e" : "#555555",
        Fold(mNames.OfVariable(variable)));
    return;
  }
  Add("  v{} [shape=box, style=\"rounded,filled\", fillcolor=\"{}\", color=\"{}\", penwidth={}, "
      "label=<<b>{}</b><br/>{}>];\n",
      variable, Fill(domain), nil ? "#b3261e" : "#55606e", nil ? 2 : 1, Escape(mNames.OfVariable(variable)),
      Fold(domain.Print()));
}

void Drawing::DrawConstraint(int number) {
  const Constraint& constraint = mModel.Constraints()[static_cast<std::size_t>(number)];
  const bool failed = mNetwork.FailedConstraint() == number;
  Add("  c{} [shape=ellipse, height=0.3, margin=\"0.05,0.02\", color=\"{}\", fontcolor=\"{}\", penwidth={}, "
      "label=\"{}\"];\n",
      number, failed ? "#b3261e" : "#3367a8", failed ? "#b3261e" : "#3367a8", failed ? 2 : 1, constraint.kind->name);
  for (std::size_t i = 0; i < constraint.arguments.size(); ++i) DrawEdge(constraint, number, i);
}

// A relation has no result but its truth value: it stands between its two sides.
void Drawing::DrawEdge(const Constraint& constraint, int number, std::size_t position) {
  const int variable = constraint.arguments[position];
  const bool relation = constraint.kind->IsRelation();
  const bool result = position == constraint.Inputs() && (!relation || constraint.kind->reified);
  const std::string_view role = constraint.arguments.size() > 2 ? constraint.RoleOf(position) : "";
  if (result || (relation && position == 1)) {
    Add("  c{} -> v{} [label=\"{}\"{}];\n", number, variable, role, result ? "" : ", dir=none");
  } else {
    Add("  v{} -> c{} [label=\"{}\"{}];\n", variable, number, role, relation ? ", dir=none" : "");
  }
}

}  // namespace

std::string Graph(const Network& network, const Names& names) { return Drawing(network, names).Draw(); }

}  // namespace zornet
