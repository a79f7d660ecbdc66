#ifndef ALDERMOOR_VEXDOC_CONDITIONS_H
#define ALDERMOOR_VEXDOC_CONDITIONS_H

#include <map>
#include <string>

#include "aldermoor/export.h"
#include "aldermoor/utilities/tools/smartpointer.h"

namespace Aldermoor::Vexdoc {

class Spectrum;

namespace Internals {
class ConditionManager;
}

/// The identity and the custom illumination of a condition block, as a layer of its own.
template <int>
class DeprecatedConditionsInterface {
 public:
  virtual std::string GetID() const = 0;
  virtual bool HasCustomIllumination() const = 0;
  virtual const Spectrum& GetCustomIllumination() const = 0;
  virtual void SetCustomIllumination(const Spectrum& spectrum) = 0;

 protected:
  DeprecatedConditionsInterface() = default;
  DeprecatedConditionsInterface(const DeprecatedConditionsInterface&) = default;
  DeprecatedConditionsInterface& operator=(const DeprecatedConditionsInterface&) = default;
  ~DeprecatedConditionsInterface() = default;
};

/// The conditions under which a value was measured or is asked for: a map of text keys to text
/// values, and an illuminant of the user's own where the illumination is "Userdefined".
///
/// Keys and values are those of the conditions vocabulary, but nothing is checked here.  The ID
/// names a block within the process and takes no part in any comparison.  Copies share the custom
/// illumination.  A sample attribute built from a Conditions holds a shared block of equal
/// content, not this object.
class ALDERMOOR_EXPORT Conditions final : public DeprecatedConditionsInterface<0> {
 public:
  /// The ID is "0".
  Conditions();
  explicit Conditions(const std::string& id);
  /// The content of `other` under another ID.
  Conditions(const std::string& id, const Conditions& other);
  Conditions(const Conditions& other);
  Conditions& operator=(const Conditions& other);
  ~Conditions();

  std::string GetID() const override;
  bool HasCustomIllumination() const override;
  /// Whether there is one and the attributes refer to it: the illumination is "Userdefined".
  bool RefersToCustomIllumination() const;
  /// Throws: ResourceNotAvailableException if there is none.
  const Spectrum& GetCustomIllumination() const override;
  /// Keeps a copy of `spectrum`; the attributes stay as they are.
  ///
  /// A block whose curve, directly or over others, has the block itself as its conditions works,
  /// but is never freed: the two hold each other.
  void SetCustomIllumination(const Spectrum& spectrum) override;

  /// Stores the value and returns the one it replaces, or the empty string.  An empty key is
  /// ignored.  Both may be parts of this object.
  std::string AddAttribute(const std::string& key, const std::string& value);
  /// Throws: ResourceNotAvailableException if the key is missing.
  std::string GetAttribute(const std::string& key) const;
  std::string GetAttribute(const std::string& key, const std::string& defaultValue) const;
  bool HasAttribute(const std::string& key) const { return attributes_.contains(key); }
  const std::map<std::string, std::string>& GetAttributes() const { return attributes_; }
  unsigned long GetAttributeCount() const { return attributes_.size(); }
  /// No effect if the key is missing.
  void RemoveAttribute(const std::string& key);
  void RemoveAllAttributes();
  /// Whether there are no attributes; the custom illumination does not count.
  bool IsEmpty() const { return attributes_.empty(); }

  /// Equal attributes and, where these say "Userdefined", equal custom illuminations.
  bool Equals(const Conditions& other) const;
  bool operator==(const Conditions& other) const { return Equals(other); }

  /// Whether `other` holds every attribute of this object with the same value, and the same custom
  /// illumination where the attributes say "Userdefined".
  /// Throws: ResourceNotAvailableException if they say so and one of the two has none.
  bool IsSubsetOf(const Conditions& other) const;

 private:
  friend class Internals::ConditionManager;

  /// Writes nothing for conditions of one's own, which other threads may build at the same time.
  void NoteChange() {
    if (is_shared_) {
      ++changes_of_shared_;
    }
  }

  std::string id_;
  std::map<std::string, std::string> attributes_;
  Utilities::Tools::SmartPointer<Spectrum> custom_illumination_;

  // Tell the manager that a block which it finds by content has got another content.
  bool is_shared_ = false;
  static unsigned long changes_of_shared_;
};

/// The block of this content that all attributes of the process share, made if there is none; what
/// SampleAttribute::SetConditions takes.
///
/// It is the block that an attribute built from `conditions` gets.  Whoever changes it changes it
/// for everybody.  Its ID is given by the process. Shared state: the blocks of the process.
ALDERMOOR_EXPORT Utilities::Tools::SmartPointer<Conditions> SharedConditions(
    const Conditions& conditions);

/// Frees the blocks that no attribute, curve or application holds any more, and returns how many
/// there were.
///
/// The library never does so by itself: a process that goes through many documents whose conditions
/// differ, by a time stamp say, calls this between them.  A block that 65,535 pointers have held at
/// one time stays for ever (SmartPointer), and so does one that its own curve holds.
/// Shared state: the blocks of the process.
ALDERMOOR_EXPORT unsigned long ReleaseUnusedConditions();

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_CONDITIONS_H
