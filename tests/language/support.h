// Models given as text, read and solved in process.
#pragma once

#include <gtest/gtest.h>

#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "language/reader.h"
#include "network/ZORNetwork.h"
#include "zornet/render.h"

// A block of a file of rows: a line that says why, a model, and behind => what is expected of it.
struct Row {
  std::string why, model, expected;
};

inline std::vector<Row> Rows(const std::string& name) {
  std::ostringstream file;
  file << std::ifstream(LANGUAGE_ROWS "/" + name).rdbuf() << '\n';
  const std::string text = file.str();
  std::vector<Row> rows;
  for (std::size_t at = 0, end; (end = text.find("\n\n", at)) != std::string::npos; at = end + 2) {
    const std::size_t model = text.find('\n', at) + 1, expected = text.find("\n=>", at) + 4;
    rows.push_back({text.substr(at, model - at), text.substr(model, expected - 3 - model),
                    text.substr(expected, end + 1 - expected)});
  }
  EXPECT_GT(rows.size(), 5u) << name;
  return rows;
}

inline zornet::Model ReadGood(const std::string& text) {
  zornet::Source source("test.szn", text);
  zornet::Diagnostics diagnostics;
  zornet::Model model = zornet::Read(source, diagnostics).model;
  EXPECT_FALSE(diagnostics.Failed()) << zornet::Render(source, diagnostics, false);
  return model;
}

// A model with its network; reading must succeed.
class Solved : public zornet::Network {
 public:
  explicit Solved(const std::string& text, const zornet::Limits& limits = {}) : Network(ReadGood(text), limits) {}

  zornet::Var Find(const std::string& name) const;
  zornet::Domain operator[](const std::string& name) const { return Network::operator[](Find(name)); }
  std::string Print(const std::string& name) const { return (*this)[name].Print(); }
  const std::string& Name(zornet::Var v) const {
    return GetModel().Variables()[static_cast<std::size_t>(v.index)].name;
  }
  std::string Print() const;  // all that is wanted
};

inline zornet::Var Solved::Find(const std::string& name) const {
  const std::vector<zornet::Variable>& variables = GetModel().Variables();
  for (std::size_t v = 0; v < variables.size(); ++v) {
    if (variables[v].name == name) return {static_cast<int>(v)};
  }
  ADD_FAILURE() << "no variable " << name;
  return {0};
}

inline std::string Solved::Print() const {
  std::string text;
  for (const int variable : GetModel().Wanted()) {
    const zornet::Domain domain = Network::operator[](variable);
    text += (text.empty() ? "" : ", ") + domain.Print() + (domain.HasShape() ? ": " + domain.PrintShape() : "");
  }
  return text;
}
