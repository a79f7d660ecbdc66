#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include "toolrun.h"

namespace Aldermoor::Tool {
namespace {

using nlohmann::json;

const char* const kOther =
    "<Sample><Name>other</Name><SampleAttribute><Gloss Conditions='2'><Angle Name='60'>7</Angle>"
    "</Gloss></SampleAttribute></Sample>";

TEST_F(ToolTest, InfoCountsSetsSamplesAttributesAndTheUsesOfConditions) {
  WriteDocument("a.xml", "Ramp",
                SampleXml("1", 0.5) + SampleXml("2", 0.5) + "<Sample><Name>empty</Name></Sample>" +
                    LabSampleXml("lab", "50", "0", "0") + kOther);
  const json document = json::parse(Run("info --format json a.xml").out)["documents"][0];
  EXPECT_EQ(document["file"], "a.xml");
  EXPECT_EQ(document["header"]["Name"], "Run 1");
  EXPECT_EQ(document["samples"], 5);
  EXPECT_EQ(document["sets"], json::parse(R"([{"name": "Ramp", "samples": 5}])"));
  EXPECT_EQ(document["attributes"],
            json::parse(R"({"ColorVector": 1, "Spectrum": 2, "UnknownSampleAttribute": 1})"));
  ASSERT_EQ(document["conditions"].size(), 2U);
  EXPECT_EQ(document["conditions"][0]["uses"], 2);
  EXPECT_EQ(document["conditions"][1]["uses"], 2);
  EXPECT_EQ(document["conditions"][1]["attributes"]["Colorimetric.Illumination"], "D50");
  const std::string text = Run("info a.xml").out;
  EXPECT_TRUE(Holds(text, "1 set, 5 samples"));
  EXPECT_TRUE(Holds(text, "conditions 2, used by 2 attributes"));
}

TEST_F(ToolTest, InfoGoesOnBehindADocumentThatCannotBeRead) {
  WriteDocument("a.xml", "Ramp", "");
  const Result result = Run("info nix.xml a.xml");
  EXPECT_EQ(result.status, 3);
  EXPECT_TRUE(Holds(result.out, "1 set, 0 samples"));
}

}  // namespace
}  // namespace Aldermoor::Tool
