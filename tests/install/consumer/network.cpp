// A program of somebody else's on the network library: a solution, a contradiction and its explanation.
#include <network/ZORNetwork.h>

#include <iostream>

int main() {
  zornet::Model model;
  const zornet::Var x = model.TextSet("x", {"ab", "cd"}), y = model.Text("y");
  model.Post("str_concat", {x, "!", y});
  zornet::Network open(model);
  open.Narrow();
  open.Search(9, [&] {
    std::cout << open[x].Print() << ' ' << open[y].Print() << '\n';
    return true;
  });

  model.Post("str_length", {x, 3});
  zornet::Network closed(model);
  if (closed.Narrow() == zornet::Outcome::Contradiction) std::cout << "contradiction\n";
  for (const zornet::Narrowing& step : closed.Explain(x).narrowings)
    std::cout << model.Constraints()[static_cast<std::size_t>(step.constraint)].kind->name << ": " << step.before
              << " -> " << step.after << '\n';
}
