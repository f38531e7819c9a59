// Which machine is it? Narrows a network, lists its solutions and says what narrowed a variable.
#include <iostream>

#include "network/ZORNetwork.h"

int main() {
  zornet::Model model;
  const zornet::Var site = model.TextSet("site", {"north", "south", "west"});
  const zornet::Var number = model.TextSet("number", {"3", "7", "12"});
  const zornet::Var label = model.TextSet("label");
  const zornet::Var machine = model.TextSet("machine", {"north-7", "north-12", "south-9", "west-3"});
  model.Post("str_concat", {site, "-", label});
  model.Post("str_concat", {label, number, machine});

  zornet::Network network(model);
  network.Narrow();
  std::cout << "site = " << network[site].Print() << '\n';
  for (const zornet::Narrowing& step : network.Explain(site).narrowings)
    std::cout << "  " << model.NameOf(step.variable) << ": " << step.before << " -> " << step.after << '\n';
  network.Search(10, [&] {
    std::cout << network[site].Print() << ' ' << network[number].Print() << '\n';
    return true;
  });
}
