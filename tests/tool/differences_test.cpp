// diff, metamerism and spectrum.
#include <cmath>
#include <cstdlib>
#include <initializer_list>
#include <utility>

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include "toolrun.h"

namespace Aldermoor::Tool {
namespace {

using nlohmann::json;

const std::string kChart = ALDERMOOR_EXAMPLES "/chart24.xml";

TEST_F(ToolTest, DiffGivesThePublishedDifferencesOfStoredColours) {
  // G. Sharma, W. Wu, E. N. Dalal, Color Res. Appl. 30, 21 (2005), table 1.  Of the pair "b" by
  // the definitions: dL = 23, da = 22.5, db = -18, C1 = 2.5, C2 = 30.806; CIE 116-1995 divides dC
  // by 1.1125 and dH by 1.0375.
  WriteDocument("a.xml", "S",
                LabSampleXml("a", "50", "2.6772", "-79.7751") +
                    LabSampleXml("b", "50", "2.5", "0") +
                    LabSampleXml("c", "2.0776", "0.0795", "-1.1350"));
  WriteDocument("b.xml", "S",
                LabSampleXml("a", "50", "0", "-82.7485") + LabSampleXml("b", "73", "25", "-18") +
                    LabSampleXml("c", "0.9033", "-0.0636", "-0.5514"));
  for (const auto& [options, difference] : std::initializer_list<std::pair<const char*, float>>{
           {"a", 2.0425F},
           {"b", 27.1492F},
           {"c", 0.9082F},
           {"b --formula CIELab", 36.868F},
           {"b --formula 94", 34.689F},
           {"b --formula 94 --weights 2,1,1", std::sqrt(11.5F * 11.5F + 674.33F)}}) {
    const std::string run = "diff a.xml b.xml --format csv --sample ";
    const auto lines = ParseCsv(Run(run + options).out);
    ASSERT_EQ(lines.size(), 2U) << options;
    EXPECT_NEAR(ToFloat(lines[1][2]), difference, difference * 1e-4F) << options;
  }
}

TEST_F(ToolTest, DiffTellsStatisticsByNearestRankAndWhichFilesKeepTheLimit) {
  std::string samples[2];  // with differences of 0.5, 1 ... 10
  for (int i = 1; i <= 20; ++i) {
    const std::string name = "p" + std::to_string(i);
    samples[0] += LabSampleXml(name, "50", "10", "10");
    samples[1] += LabSampleXml(name, std::to_string(50.0 + 0.5 * i).c_str(), "10", "10");
  }
  WriteDocument("a.xml", "S", samples[0]);
  WriteDocument("b.xml", "S", samples[1]);
  const std::string run = "diff a.xml a.xml b.xml --formula CIELab --format json --limit ";
  const Result result = Run(run + "9.9");
  EXPECT_EQ(result.status, 1);
  const json all = json::parse(result.out);
  const json& b = all["summary"].at(1);
  EXPECT_NEAR(b["mean"].get<float>(), 5.25F, 1e-4F);
  EXPECT_NEAR(b["median"].get<float>(), 5.25F, 1e-4F);
  EXPECT_NEAR(b["p95"].get<float>(), 9.5F, 1e-4F);  // 19 of 20 do not exceed it
  EXPECT_NEAR(b["maximum"].get<float>(), 10.0F, 1e-4F);
  EXPECT_EQ(b["maximum sample"], "p20");
  EXPECT_EQ(b["result"], "fail");
  EXPECT_EQ(all["summary"].at(0)["result"], "pass");
  EXPECT_EQ(Run(run + "10.01").status, 0);
  EXPECT_EQ(Run(run + "10.01 --set T").status, 1) << "nothing was compared";
}

TEST_F(ToolTest, DiffPairsWithinEqualSetsAndElseByUnambiguousNames) {
  // A set for each word, with a sample for each letter behind its first.
  const auto write = [this](const char* name, const std::vector<std::string>& sets) {
    std::string samples;
    for (const std::string& set : sets) {
      samples += "</SampleSet><SampleSet><Name>" + set.substr(0, 1) + "</Name>";
      for (const char sample : set.substr(1)) {
        samples += LabSampleXml(std::string(1, sample), "50", "0", "0");
      }
    }
    WriteDocument(name, name, samples);
  };
  write("a.xml", {"Axy", "Bxz"});
  struct Case {
    std::vector<std::string> sets;
    const char* pairs;
    const char* told;
  };
  for (const Case& c : {Case{{"Ayx", "Bxz"}, "Ay Ax Bx Bz ", ""},
                        Case{{"Axyz", "Cxz"}, "Ax Ay Cx Cz ", "b.xml: A/z: there is no such"},
                        Case{{"Cxyz"}, "Cy Cz ", "b.xml: C/x: sets of different names hold"},
                        Case{{"Cy", "Dz", "Ez"}, "Cy ", "b.xml: D/z: sets of different names hold"},
                        Case{{"Ax"}, "Ax ", "a.xml: A/y: there is no such sample in b.xml"}}) {
    write("b.xml", c.sets);
    const Result result = Run("diff a.xml b.xml --format csv");
    std::string pairs;
    for (const Fields& line : ParseCsv(result.out)) {
      pairs += line.at(0) == "set" ? "" : line.at(0) + line.at(1) + " ";
    }
    EXPECT_EQ(pairs, c.pairs);
    EXPECT_TRUE(Holds(result.err, c.told));
    EXPECT_EQ(result.status, *c.told == '\0' ? 0 : 1) << c.pairs;
  }
}

TEST_F(ToolTest, DiffComparesSpectraWithColoursOnlyWhereTheseHoldForTheRequest) {
  // Half the reflectance has L* = 116 * cbrt(0.5) - 16 = 76.069 under every illuminant.
  WriteDocument("a.xml", "S", SampleXml("gray", 0.5) + LabSampleXml("lab", "50", "0", "0"));
  WriteDocument("b.xml", "S",
                LabSampleXml("gray", "70.069", "0", "0") + LabSampleXml("lab", "51", "0", "0"));
  const auto lines = ParseCsv(Run("diff a.xml b.xml --formula CIELab --format csv").out);
  ASSERT_EQ(lines.size(), 3U);
  EXPECT_NEAR(ToFloat(lines[1][2]), 6.0F, 2e-3F);
  const Result other = Run("diff a.xml b.xml --illuminant A");
  EXPECT_TRUE(Holds(other.err, "S/gray: the colour holds for"));
  EXPECT_TRUE(Holds(other.err, "S/lab: the reference: the colour holds for"));
}

TEST_F(ToolTest, ReconstructedSpectraMatchUnderTheirLightAndAreMetamericUnderOthers) {
  ASSERT_EQ(Run("spectrum --illuminant D65 --save b.xml --input " + kChart).status, 0);
  const std::string under = "diff --format csv --formula CIELab " + kChart + " b.xml --illuminant ";
  const auto matched = ParseCsv(Run(under + "D65").out);
  const auto under_a = ParseCsv(Run(under + "A").out);
  const auto indices = ParseCsv(
      Run("metamerism --format csv --reference D65 --test D65,A " + kChart + " b.xml").out);
  ASSERT_EQ(matched.size(), 25U);
  ASSERT_EQ(indices.size(), 25U);
  for (std::size_t i = 1; i < indices.size(); ++i) {
    EXPECT_LT(ToFloat(matched[i][2]), 0.1F + 1e-3F) << matched[i][1];
    EXPECT_NEAR(ToFloat(indices[i][2]), 0.0F, 1e-3F) << "what differs there is divided out";
    EXPECT_NEAR(ToFloat(indices[i][3]), ToFloat(under_a[i][2]), 0.3F) << indices[i][1];
  }
  EXPECT_GT(ToFloat(indices[1][3]), 1.0F);
  const Result impossible = Run("spectrum 50,20,10 0,100,0 --format json");
  EXPECT_TRUE(Holds(impossible.err, "0,100,0: no reflectance spectrum was found"));
  const json results = json::parse(impossible.out)["results"];
  ASSERT_EQ(results.size(), 1U);
  EXPECT_EQ(results[0].size(), 2U + 36U);
}

}  // namespace
}  // namespace Aldermoor::Tool
