// Models given as text, read and solved in process.
#pragma once

#include <gtest/gtest.h>

#include <string>

#include "language/reader.h"
#include "network/ZORNetwork.h"
#include "zornet/render.h"

inline zornet::Model ReadGood(const std::string& text) {
  const zornet::Source source("test.szn", text);
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
  for (const int variable : GetModel().Wanted())
    text += (text.empty() ? "" : ", ") + Network::operator[](variable).Print();
  return text;
}
