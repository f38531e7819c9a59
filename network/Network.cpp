#include <algorithm>
#include <utility>

#include "network/ZORNetwork.h"
#include "network/log.h"
#include "network/propagation.h"
#include "network/search.h"
#include "network/session.h"
#include "network/store.h"

namespace zornet {

bool Domain::IsNil() const { return mValue->IsNil(); }
bool Domain::IsAny() const { return mValue->IsUndefined(); }
bool Domain::IsKnown() const { return mValue->IsKnown(); }
bool Domain::IsOne() const { return mValue->IsOne(); }

std::vector<std::string> Domain::Texts() const {
  std::vector<std::string> texts;
  for (const ZORString& text : mValue->Texts()) texts.emplace_back(ToView(text));
  return texts;
}

std::vector<std::int32_t> Domain::Numbers() const { return mValue->Numbers(); }
std::int32_t Domain::Lowest() const { return mValue->LowestNumber(); }
std::int32_t Domain::Highest() const { return mValue->HighestNumber(); }
std::string Domain::Print() const { return mValue->Show(); }

TextShape Domain::Shape() const {
  const auto text = [](const ZORString& held) { return std::string(held.View()); };
  const zornet::Shape& shape = *mShape;
  TextShape told{shape.shortest,
                 shape.longest,
                 text(shape.beginning),
                 text(shape.end),
                 text(shape.Lowest()),
                 text(shape.orGreatest ? shape.greatest : shape.Highest()),
                 "",
                 shape.orGreatest};
  for (std::size_t bit = 0; bit < shape.characters.size(); ++bit) {
    if (shape.characters[bit]) told.characters += CharacterAt(bit);
  }
  return told;
}

std::string Domain::PrintShape() const { return HasShape() ? Describe(*mShape) : ""; }

bool Domain::Admits(std::string_view text) const {
  if (HasShape()) return mShape->Admits(text);
  if (!IsKnown()) return IsAny();
  const std::vector<ZORString> texts = mValue->Texts();
  return std::any_of(texts.begin(), texts.end(), [&](const ZORString& listed) { return listed.View() == text; });
}

namespace {

// Passes on what is narrowed.
class Teller : public Watcher {
 public:
  explicit Teller(std::function<void(const Narrowing&)> told) : mTold(std::move(told)) {}
  void Narrowed(const Narrowing& narrowing) override { mTold(narrowing); }

 private:
  std::function<void(const Narrowing&)> mTold;
};

// Where nothing is wanted in particular, all is.
Model WithWanted(Model model) {
  if (!model.Wanted().empty()) return model;
  for (int v = 0; v < static_cast<int>(model.Variables().size()); ++v) {
    if (!model.Variables()[static_cast<std::size_t>(v)].constant) model.Want({v});
  }
  return model;
}

}  // namespace

// In the order in which they need each other: values must be gone before the session in which they were made.
struct Network::Inside {
  Inside(zornet::Model given, const Limits& bounds, const std::vector<std::string>& folders)
      : model(WithWanted(std::move(given))),
        limits(bounds),
        session(Session::Open(folders)),
        store(session->Types(), model),
        propagation(store, limits) {}

  const Model model;
  const Limits limits;
  const std::shared_ptr<const Session> session;
  Store store;
  Propagation propagation;
  std::unique_ptr<Teller> teller;
};

Network::Network(Model model, const Limits& limits, const std::vector<std::string>& moduleFolders)
    : mInside(std::make_unique<Inside>(std::move(model), limits, moduleFolders)) {}
Network::~Network() = default;
Network::Network(Network&&) noexcept = default;
Network& Network::operator=(Network&&) noexcept = default;

Outcome Network::Narrow() { return mInside->propagation.Run(); }

SearchResult Network::Search(std::uint64_t most, const std::function<bool()>& found) {
  SearchResult result;
  result.outcome = Narrow();
  result.complete = result.outcome == Outcome::Contradiction;
  if (result.outcome != Outcome::Settled) return result;
  zornet::Search search(mInside->store, mInside->propagation);
  result.outcome = search.Run(most, found);
  result.solutions = search.Found();
  result.open = search.Open();
  for (const int variable : search.OpenVariables()) result.openVariables.push_back({variable});
  result.complete = search.IsExhausted() && result.open == 0;
  if (search.IsExhausted() && result.open != 0) result.outcome = Outcome::Open;
  if (result.complete && result.solutions == 0) result.outcome = Outcome::Contradiction;
  return result;
}

const Model& Network::GetModel() const { return mInside->model; }
Domain Network::operator[](Var variable) const {
  return Domain(mInside->store[variable.index], mInside->store.HeldShape(variable.index));
}
ZORVaDoAny& Network::Bare(Var variable) { return mInside->store.Bare(variable.index).Any(); }
Var Network::FailedVariable() const { return {mInside->store.Failed()}; }
int Network::FailedConstraint() const { return mInside->store.FailedConstraint(); }

Explanation Network::Explain(Var variable) const {
  Store store(mInside->session->Types(), mInside->model);
  Log log(mInside->model);
  store.Watch(&log);
  Limits limits;
  limits.budget = mInside->limits.budget;
  limits.steps = mInside->propagation.Steps();
  Propagation(store, limits).Run();
  Explanation explanation = log.Explain(variable.index);
  const Store start(mInside->session->Types(), mInside->model);
  for (Explanation::Start& declared : explanation.declared) declared.value = start[declared.variable.index].Show();
  return explanation;
}

std::vector<LimitMet> Network::LimitsMet() const {
  if (mInside->store.HasFailed()) return {};
  std::vector<LimitMet> met = mInside->store.LimitsMet();
  mInside->propagation.AddLimitsMet(met);
  std::erase_if(met, [this](const LimitMet& each) { return (*this)[each.variable].IsOne(); });
  return met;
}

void Network::OnNarrowing(std::function<void(const Narrowing&)> told) {
  mInside->teller = told ? std::make_unique<Teller>(std::move(told)) : nullptr;
  mInside->store.Watch(mInside->teller.get());
}

void Network::OnProgress(std::function<void(std::uint64_t, std::size_t)> told) {
  mInside->propagation.OnProgress(std::move(told));
}

std::uint64_t Network::Steps() const { return mInside->propagation.Steps(); }

std::vector<OperationCount> Network::Counts() const {
  std::vector<OperationCount> counts;
  for (std::size_t i = 0; i < kOperations; ++i) {
    const OperationCounts& count = mInside->store.Counts()[i];
    if (count.calls != 0)
      counts.push_back({NameOf(static_cast<Operation>(i)), count.calls, count.changes, count.contradictions});
  }
  return counts;
}

}  // namespace zornet
