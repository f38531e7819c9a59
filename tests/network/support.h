// Models given as text, read and solved in process.
#pragma once

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "language/reader.h"
#include "network/propagation.h"
#include "network/search.h"
#include "network/session.h"
#include "network/store.h"
#include "zornet/render.h"

// One session serves all tests: modules are opened once.
inline const zornet::Session& TheSession() {
  static const zornet::Session session;
  return session;
}

// A model with its network; reading must succeed.
class Solved {
 public:
  explicit Solved(const std::string& text, const zornet::Limits& limits = {})
      : source("test.szn", text),
        model(ReadGood(source)),
        store(TheSession().Types(), model),
        propagation(store, limits) {}

  zornet::Outcome Settle() { return propagation.Run(); }
  int Find(const std::string& name) const;
  std::string Show(const std::string& name) const { return store[Find(name)].Show(); }

  zornet::Source source;
  zornet::Model model;
  zornet::Store store;
  zornet::Propagation propagation;

 private:
  static zornet::Model ReadGood(const zornet::Source& source);
};

inline zornet::Model Solved::ReadGood(const zornet::Source& source) {
  zornet::Diagnostics diagnostics;
  zornet::Model model = zornet::Read(source, diagnostics).model;
  EXPECT_FALSE(diagnostics.Failed()) << zornet::Render(source, diagnostics, false);
  return model;
}

inline int Solved::Find(const std::string& name) const {
  for (std::size_t v = 0; v < model.variables.size(); ++v) {
    if (model.variables[v].name == name) return static_cast<int>(v);
  }
  ADD_FAILURE() << "no variable " << name;
  return 0;
}
