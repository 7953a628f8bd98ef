#include "gallery/ChecksPageModel.h"

ChecksPageModel::ChecksPageModel(Canvas* page)
    : Glob(GlobCreationInfo(1, 1, page)), loopAdaptor_(new ValServerAdaptor<bool>(&loop_)) {
  unmap_canvas();
  loopPair_.setDataAdaptor(Kw::Ptr<ValAdaptorBase<bool>>(loopAdaptor_));
}

void ChecksPageModel::bind(Checkbox* box) {
  box->setDataAdaptor(Kw::Ptr<ValAdaptorBase<bool>>(loopAdaptor_));
  box->setState(loop_.getValue(), false);
}

void ChecksPageModel::setAllBox(TriStateBox* all, Checkbox* first, Checkbox* second) {
  all_ = GlobHandle<TriStateBox>(all);
  members_[0] = GlobHandle<Checkbox>(first);
  members_[1] = GlobHandle<Checkbox>(second);
  all->setUserFunction(&ChecksPageModel::allClicked, this);
  first->setUserFunction(&ChecksPageModel::memberClicked, this);
  second->setUserFunction(&ChecksPageModel::memberClicked, this);
  showMembersInAllBox();
}

void ChecksPageModel::showMembersInAllBox() {
  TriStateBox* all = all_.get();
  Checkbox* a = members_[0].get();
  Checkbox* b = members_[1].get();
  if (!all || !a || !b) return;
  const bool mixed = a->getState() != b->getState();
  all->setTriState(mixed, true);
  all->setState(!mixed && a->getState());
}

void ChecksPageModel::allClicked(Checkbox* box, void* data) {
  auto* self = static_cast<ChecksPageModel*>(data);
  auto* all = static_cast<TriStateBox*>(box);
  // A mixed or clear "all" box ticks everything; a ticked one clears everything.
  const bool tick = all->getTriState() || !all->getState();
  for (GlobHandle<Checkbox>& m : self->members_)
    if (Checkbox* member = m.get()) member->setState(tick);
  self->showMembersInAllBox();
  all->sendToggleMessage(true);
}

void ChecksPageModel::memberClicked(Checkbox* box, void* data) {
  auto* self = static_cast<ChecksPageModel*>(data);
  box->setState(!box->getState());
  self->showMembersInAllBox();
  box->sendToggleMessage(true);
}
