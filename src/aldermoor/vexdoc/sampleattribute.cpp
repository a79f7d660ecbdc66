#include "aldermoor/vexdoc/sampleattribute.h"

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/sample.h"
#include "aldermoor/vexdoc/setparent.h"

namespace Aldermoor::Vexdoc {

SampleAttribute::SampleAttribute(const std::string& name) try
    : DeprecatedSampleAttributeInterface(name, "") {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleAttribute::SampleAttribute)

SampleAttribute::~SampleAttribute() = default;

void SampleAttribute::SetParent(Header* parent) try { MoveToParent<Sample>(*this, parent); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleAttribute::SetParent)

}  // namespace Aldermoor::Vexdoc
