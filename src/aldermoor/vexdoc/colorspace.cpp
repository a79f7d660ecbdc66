#include "aldermoor/vexdoc/colorspace.h"

#include <sstream>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc {

using Utilities::Exceptions::Filled;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::Tools::SmartPointer;

namespace {

[[noreturn]] void FailSize(const std::string& color_space, std::size_t expected,
                           std::size_t actual) {
  std::ostringstream text;
  text << "Inconsistent ColorVector-size"
       << "(expected " << expected << " but got " << actual << " elements for colorspace "
       << color_space << ")";
  throw VexParseException(text.str(), ALDERMOOR_HERE(Aldermoor::Vexdoc::ColorSpace::ColorSpace));
}

const ColorScheme::Channels& Checked(const std::string& color_space,
                                     const ColorScheme::Channels& data) {
  const std::size_t expected = color_space == "CMYK" ? 4 : 3;
  if (data.size() != expected) {
    FailSize(color_space, expected, data.size());
  }
  return data;
}

ColorScheme::Channels make_colorscheme_datastore(const std::string& color_space,
                                                 const std::vector<float>& values) {
  // The labels of absolute values come first, and those of differences behind them.
  const std::vector<std::string>& labels = GetChannelLabels(color_space);
  if (values.size() > labels.size()) {
    FailSize(color_space, labels.size() / 2, values.size());
  }
  ColorScheme::Channels channels;
  channels.reserve(values.size());
  for (std::size_t i = 0; i < values.size(); ++i) {
    channels.emplace_back(labels[i], values[i]);
  }
  return channels;
}

}  // namespace

ColorSpace::ColorSpace(const std::string& colorSpace, const Channels& data) try
    : ColorScheme(Checked(colorSpace, data)) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorSpace::ColorSpace)

ColorSpace::ColorSpace(const std::string& colorSpace, const std::vector<float>& values) try
    : ColorScheme(make_colorscheme_datastore(colorSpace, values)) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorSpace::ColorSpace)

ColorSpace::ColorSpace(const ColorSpace&) = default;
ColorSpace& ColorSpace::operator=(const ColorSpace&) = default;
ColorSpace::~ColorSpace() = default;

SmartPointer<SampleAttribute> ColorSpace::TransformTo(const std::string& type,
                                                      const Conditions& target,
                                                      const Conditions& own) try {
  SmartPointer<SampleAttribute> result;
  if (type == "VEXColorVector") {
    result = target.IsSubsetOf(own) ? SmartPointer<SampleAttribute>(new ColorVector(own, GetData()))
                                    : ComputeColorVector(GetData(), own, target);
  }
  if (!result) {
    throw ResourceNotAvailableException(
        Filled("Could not convert 'VEXColorSpace' to '%TYPE%'", "%TYPE%", type), "");
  }
  return result;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorSpace::TransformTo)

}  // namespace Aldermoor::Vexdoc
