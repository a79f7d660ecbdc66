#ifndef ALDERMOOR_VEXDOC_SAMPLEATTRIBUTE_H
#define ALDERMOOR_VEXDOC_SAMPLEATTRIBUTE_H

#include <string>

#include "aldermoor/export.h"
#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/header.h"

namespace Aldermoor::Vexdoc {

class SampleAttribute;

/// The computation that every sample attribute offers, as a layer of its own.
template <int>
class DeprecatedSampleAttributeInterface : public Header {
 public:
  using Header::Header;

  virtual Utilities::Tools::SmartPointer<SampleAttribute> TransformTo(
      const std::string& type, const Conditions& conditions) = 0;
};

/// What a Sample holds: a measured or computed value under shared Conditions.
///
/// Kinds are selected by their long type names: "VEXSpectrum", "VEXColorVector", "VEXRecipe" and
/// "VEXUnknownSampleAttribute".
class ALDERMOOR_EXPORT SampleAttribute : public DeprecatedSampleAttributeInterface<0> {
 public:
  explicit SampleAttribute(const std::string& name = "");
  SampleAttribute(const SampleAttribute&) = default;
  SampleAttribute& operator=(const SampleAttribute&) = default;
  ~SampleAttribute() override;

  void SetParent(Header* parent) override;

  /// Computes a new attribute of the kind `type` under `conditions` from this one, which stays as
  /// it is.  A computed result is flagged as derived.
  /// Throws: ResourceNotAvailableException if this attribute cannot give it.
  Utilities::Tools::SmartPointer<SampleAttribute> TransformTo(
      const std::string& type, const Conditions& conditions) override = 0;

  /// The long type name of the kind.
  virtual std::string GetType() const = 0;
  virtual bool operator==(const SampleAttribute& other) const = 0;
  virtual bool operator!=(const SampleAttribute& other) const = 0;
  /// Empty for an attribute built without conditions.
  virtual const Utilities::Tools::SmartPointer<Conditions>& GetConditions() const = 0;
  /// Whether the attribute was computed and is no part of the stored data; it is never written
  /// to a file.
  virtual bool IsDerived() const = 0;
  virtual void SetDerived(bool derived) = 0;
  /// Takes over `other` if it is of the same class; else nothing changes.
  virtual SampleAttribute& Assign(const SampleAttribute& other) = 0;
  virtual bool Equals(const SampleAttribute& other) const = 0;
  /// Takes the block itself; SharedConditions gives the one that attributes of equal conditions
  /// share.  A block of one's own serves too, and is saved with what it holds.
  virtual void SetConditions(const Utilities::Tools::SmartPointer<Conditions>& conditions) = 0;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_SAMPLEATTRIBUTE_H
