// SPDX-License-Identifier: MIT
// Finds views and windows by their objects. A node retains its object, so the address of an entry
// cannot be that of a newer object.

#import "toolkit/appkit/desk.hpp"

#include <algorithm>
#include <utility>

#import "toolkit/appkit/views.hpp"
#import "toolkit/appkit/window.hpp"

namespace qz::toolkit::appkit {

std::shared_ptr<ViewNode> Desk::nodeOf(NSView* view) {
  const auto found = views_.find(view);
  const auto known = found == views_.end() ? nullptr : found->second.lock();
  return known ? known : makeView(view, shared_from_this());
}

std::shared_ptr<AppKitWindow> Desk::windowOf(NSWindow* window) {
  if (auto known = knownWindow(window)) return known;
  return AppKitWindow::make(window, shared_from_this(), KeptBy::host);
}

std::shared_ptr<AppKitWindow> Desk::knownWindow(NSWindow* window) const {
  const auto found = windows_.find(window);
  return found == windows_.end() ? nullptr : found->second.lock();
}

std::vector<std::shared_ptr<AppKitWindow>> Desk::windows() const {
  std::vector<std::shared_ptr<AppKitWindow>> all;
  for (const auto& [key, window] : windows_) {
    if (auto known = window.lock()) all.push_back(std::move(known));
  }
  return all;
}

void Desk::enter(NSView* view, const std::shared_ptr<ViewNode>& node) {
  views_.insert_or_assign(view, node);
}

void Desk::enter(NSWindow* window, const std::shared_ptr<AppKitWindow>& known) {
  windows_.insert_or_assign(window, known);
}

void Desk::keep(const std::shared_ptr<AppKitWindow>& window) {
  if (std::find(kept_.begin(), kept_.end(), window) == kept_.end()) kept_.push_back(window);
}

void Desk::letGo(const AppKitWindow& window) {
  const auto place = std::find_if(kept_.begin(), kept_.end(),
                                  [&](const auto& kept) { return kept.get() == &window; });
  if (place == kept_.end()) return;
  const auto last = std::move(*place);  // its end may call this again, so the list must be whole
  kept_.erase(place);
}

void Desk::letAllGo() { const auto last = std::exchange(kept_, {}); }

void Desk::present(const std::shared_ptr<Responder>& responder, id object) {
  presented_.erase(responder.get());
  if (object) presented_.insert_or_assign(responder.get(), Presented{object, responder});
}

id Desk::objectFor(const Responder* responder) const {
  const auto found = presented_.find(responder);
  return found == presented_.end() ? nil : found->second.object;
}

std::shared_ptr<Responder> Desk::responderOf(id object) const {
  for (const auto& [key, presented] : presented_) {
    if (presented.object == object) return presented.responder.lock();
  }
  return nullptr;
}

}  // namespace qz::toolkit::appkit
