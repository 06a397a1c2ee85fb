#pragma once

#include <string>

#include "core/kvs.h"
#include "core/message.h"
#include "core/object_state.h"

namespace gridbay {

// Base of all parts of a model. An object knows its parameters with their defaults, writes itself under the
// cursor of a parameter file, reads itself from a section, checks itself and copies itself from a like
// object.
class CKvsBase {
 public:
  // The parent owns the object; the root has none.
  explicit CKvsBase(CKvsBase* parent) : parent_(parent) {}
  CKvsBase(const CKvsBase&) = delete;
  CKvsBase& operator=(const CKvsBase&) = delete;
  virtual ~CKvsBase() = default;

  // Appends a message for each fault and returns how many. With `deep` 0 a list leaves out its items.
  virtual unsigned Validate(ValidationList& messages, int deep);
  virtual void Save(KvsFile& file, const std::string& documentPath) = 0;
  // Reads the object from the section that holds it. What the file lacks keeps its value.
  virtual void Load(KvsSection section, const std::string& documentPath) = 0;
  // Takes over the values of another object of the same class.
  virtual void CopyFrom(const CKvsBase& other);
  virtual CKvsBase* GetParent();
  virtual CKvsBase* GetRoot();
  virtual CKvsBase* FindChildKvs();

  // The exact state, with what stands on no file: taken over from, and compared with, another object of the
  // same class. Nobody is told.
  virtual void AssignState(const CKvsBase& other);
  virtual bool SameState(const CKvsBase& other) const;
  // Brings the twin, an object of the same class, to the state of this one and returns what that changed;
  // null when it was the same.
  virtual std::unique_ptr<StateChange> TakeChange(CKvsBase& twin);
  // Finds what a path names in this object; false when there is no such thing.
  virtual bool AccessPath(std::string_view path, PathAccess& access);

  // Whether a text is a usable path name; the file need not exist.
  static bool IsValidPathName(const char* path);
  // Copies all that a section of a loaded file holds, in order, under the cursor of a file in writing.
  static void CopySection(KvsSection source, KvsFile& destination);

  // The members that a room has in the root of the model, as `parts<BasicParts>()`; null where the object
  // stands in no whole model.
  template <class Parts>
  Parts* parts() {
    return dynamic_cast<Parts*>(GetRoot());
  }

  // Shows a text to the user through the root's host and returns.
  void Tell(const std::string& text) { ShowMessage(text); }

 protected:
  // Of a class whose copies stand where the object that was copied stands.
  void TakeParent(const CKvsBase& other) { parent_ = other.parent_; }
  virtual void ShowMessage(const std::string& text);

 private:
  CKvsBase* parent_;
};

}  // namespace gridbay
