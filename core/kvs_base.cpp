#include "core/kvs_base.h"

#include "platform/files/paths.h"

namespace gridbay {

unsigned CKvsBase::Validate(ValidationList&, int) {
  return 0;
}

void CKvsBase::CopyFrom(const CKvsBase&) {}

CKvsBase* CKvsBase::GetParent() {
  return parent_;
}

CKvsBase* CKvsBase::GetRoot() {
  CKvsBase* top = this;
  while (top->parent_ != nullptr) top = top->parent_;
  return top;
}

CKvsBase* CKvsBase::FindChildKvs() {
  return nullptr;
}

void CKvsBase::AssignState(const CKvsBase&) {}

bool CKvsBase::SameState(const CKvsBase&) const {
  return true;
}

std::unique_ptr<StateChange> CKvsBase::TakeChange(CKvsBase&) {
  return nullptr;
}

bool CKvsBase::AccessPath(std::string_view, PathAccess&) {
  return false;
}

bool CKvsBase::IsValidPathName(const char* path) {
  return path != nullptr && isUsablePathName(path);
}

void CKvsBase::CopySection(KvsSection source, KvsFile& destination) {
  for (const Node* node = source->first(); node != nullptr; node = node->next()) {
    if (node->isSection()) {
      kvsAddSection(destination, node->name());
      CopySection(node, destination);
      kvsEndSection(destination);
    } else {
      kvsAddKeyword(destination, node->name());
      for (const Value& value : node->values()) destination.add(value.kind(), value.text());
    }
  }
}

void CKvsBase::ShowMessage(const std::string& text) {
  if (parent_ != nullptr) parent_->ShowMessage(text);
}

}  // namespace gridbay
