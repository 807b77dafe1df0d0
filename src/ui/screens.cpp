#include "ui/screens.h"

#include <algorithm>

#include "data/text.h"

namespace marlowbeck {

void Screens::Register(std::string_view name, Factory factory) {
  factories_[UpperCase(name)] = std::move(factory);
}

bool Screens::Knows(std::string_view name) const { return factories_.contains(UpperCase(name)); }

std::vector<std::string> Screens::Names() const {
  std::vector<std::string> names;
  for (const auto& [name, factory] : factories_) names.push_back(name);
  return names;
}

std::unique_ptr<Screen> Screens::Make(std::string_view name) {
  const auto factory = factories_.find(UpperCase(name));
  return factory == factories_.end() ? nullptr : factory->second(*this);
}

Screen* Screens::Find(std::string_view name) const {
  for (const auto& screen : loaded_) {
    if (EqualsIgnoringCase(screen->Name(), name)) return screen.get();
  }
  return nullptr;
}

std::shared_ptr<Screen> Screens::Hold(const Screen& screen) const {
  const auto place = std::find_if(loaded_.begin(), loaded_.end(),
                                  [&](const auto& loaded) { return loaded.get() == &screen; });
  return place == loaded_.end() ? nullptr : *place;
}

Screen* Screens::Load(std::string_view name) {
  if (Screen* const screen = Find(name)) return screen;
  std::unique_ptr<Screen> made = Make(name);
  if (made == nullptr) return nullptr;
  // Lowest of all until it is shown.
  Screen* const screen = loaded_.insert(loaded_.begin(), std::move(made))->get();
  dispatcher_.Run([screen] { screen->Load(); });
  return Find(name) == screen ? screen : nullptr;
}

Screen* Screens::Show(std::string_view name) {
  Screen* const screen = ended_ ? nullptr : Load(name);
  if (screen == nullptr || ended_) return nullptr;
  BringToFront(*screen);
  screen->SetVisible(true);
  Activate(*screen);
  return Find(name) == screen ? screen : nullptr;
}

Screen* Screens::ShowQuietly(std::string_view name) {
  Screen* const screen = Load(name);
  if (screen == nullptr) return nullptr;
  BringToFront(*screen);
  screen->SetVisible(true);
  return screen;
}

void Screens::HideQuietly(Screen& screen) { screen.SetVisible(false); }

void Screens::Hide(Screen& screen) {
  const Screen* const before = Front();
  screen.SetVisible(false);
  ActivateFrontUnless(before);
}

void Screens::Unload(Screen& screen) {
  const auto place = std::find_if(loaded_.begin(), loaded_.end(),
                                  [&](const auto& loaded) { return loaded.get() == &screen; });
  if (place == loaded_.end()) return;  // it is on its way out already
  const Screen* const before = Front();
  const std::shared_ptr<Screen> leaving = *place;
  loaded_.erase(place);
  leaving_.push_back(leaving);
  leaving->SetVisible(false);
  ActivateFrontUnless(before);
  dispatcher_.Run([&] { leaving->Unload(); });
  if (leaving->Closed) dispatcher_.Run(leaving->Closed);
}

void Screens::ActivateFrontUnless(const Screen* before) {
  Screen* const front = Front();
  if (front != nullptr && front != before) Activate(*front);
}

void Screens::Activate(Screen& screen) {
  dispatcher_.Run([&] { screen.Activate(); });
}

Screen* Screens::Front() const {
  const auto place = std::find_if(loaded_.rbegin(), loaded_.rend(),
                                  [](const auto& screen) { return screen->Visible(); });
  return place == loaded_.rend() ? nullptr : place->get();
}

void Screens::BringToFront(Screen& screen) {
  if (&screen == Front()) return;
  const auto place = std::find_if(loaded_.begin(), loaded_.end(),
                                  [&](const auto& loaded) { return loaded.get() == &screen; });
  if (place != loaded_.end()) std::rotate(place, place + 1, loaded_.end());
}

Control* Screens::Focus() const {
  const Screen* const front = Front();
  return front == nullptr ? nullptr : front->Focus();
}

void Screens::Settle() {
  if (!dispatcher_.Idle()) return;
  leaving_.clear();
  if (Screen* const front = Front()) front->EnsureFocus();
}

}  // namespace marlowbeck
