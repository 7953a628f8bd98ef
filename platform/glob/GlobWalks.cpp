// Glob: walks over the tree and the counts and steps that go with them. Every walk takes a
// snapshot of handles first and skips Globs that a callback deleted meanwhile, so a callback
// may delete what it is given, its siblings or the Glob walked from.
#include <algorithm>

#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"

namespace {

using Snapshot = std::vector<GlobHandle<>>;

Glob* walkOver(const Snapshot& globs, const GlobWalk& fn) {
  if (!fn) return nullptr;
  for (const auto& h : globs) {
    Glob* g = h.get();
    if (g && fn(g)) return h.get();
  }
  return nullptr;
}

Snapshot handlesOf(const std::vector<Glob*>& globs) {
  return Snapshot(globs.begin(), globs.end());
}

// This Glob's siblings in stacking order, oldest first, and where it stands among them.
std::vector<Glob*> siblingsOf(const Glob* g, size_t& self) {
  std::vector<Glob*> sib;
  self = 0;
  Glob* p = g->parent();
  if (!p) return sib;
  sib = p->children();
  auto it = std::find(sib.begin(), sib.end(), g);
  self = static_cast<size_t>(it - sib.begin());
  return sib;
}

void collectPreorder(Glob* g, std::vector<Glob*>& out) {
  out.push_back(g);
  for (Glob* c : g->children()) collectPreorder(c, out);
}

void collectPostorder(Glob* g, std::vector<Glob*>& out) {
  for (Glob* c : g->children()) collectPostorder(c, out);
  out.push_back(g);
}

}  // namespace

Glob* Glob::walk_older_siblings(const GlobWalk& fn) {
  size_t self = 0;
  const std::vector<Glob*> sib = siblingsOf(this, self);
  if (sib.empty()) return nullptr;
  return walkOver(handlesOf(std::vector<Glob*>(sib.rend() - static_cast<long>(self), sib.rend())),
                  fn);
}

Glob* Glob::walk_younger_siblings(const GlobWalk& fn) {
  size_t self = 0;
  const std::vector<Glob*> sib = siblingsOf(this, self);
  if (self + 1 >= sib.size()) return nullptr;
  return walkOver(
      handlesOf(std::vector<Glob*>(sib.begin() + static_cast<long>(self) + 1, sib.end())), fn);
}

Glob* Glob::walk_siblings(const GlobWalk& fn) {
  size_t self = 0;
  std::vector<Glob*> sib = siblingsOf(this, self);
  if (self < sib.size()) sib.erase(sib.begin() + static_cast<long>(self));
  return walkOver(handlesOf(sib), fn);
}

Glob* Glob::walk_children(const GlobWalk& fn) {
  return walkOver(handlesOf(children()), fn);
}

Glob* Glob::walk_ancestors(const GlobWalk& fn) {
  std::vector<Glob*> up;
  for (Glob* p = parent(); p; p = p->parent()) up.push_back(p);
  return walkOver(handlesOf(up), fn);
}

Glob* Glob::walk_subtree(const GlobWalk& fn) {
  std::vector<Glob*> all;
  collectPreorder(this, all);
  return walkOver(handlesOf(all), fn);
}

Glob* Glob::walk_postorder(const GlobWalk& fn) {
  std::vector<Glob*> all;
  collectPostorder(this, all);
  return walkOver(handlesOf(all), fn);
}

int Glob::sibling_count() const {
  Glob* p = parent();
  return p ? p->child_count() - 1 : 0;
}

int Glob::child_count() const {
  int n = 0;
  for (Canvas* c : canvas_.children()) n += globOf(c) ? 1 : 0;
  return n;
}

Glob* Glob::next_child(Glob* child) const {
  const auto& kids = canvas_.children();
  auto it = kids.begin();
  if (child) {
    if (!is_good_glob_ptr(child) || child->parent() != this) return nullptr;
    it = std::find(kids.begin(), kids.end(), child->canvas());
    if (it == kids.end()) return nullptr;
    ++it;
  }
  for (; it != kids.end(); ++it) {
    if (Glob* g = globOf(*it)) return g;
  }
  return nullptr;
}
