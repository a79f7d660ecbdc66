#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include "toolrun.h"

namespace Aldermoor::Tool {
namespace {

// The cache of an empty document with one value in its header, in the words of printf.
const std::string kCache =
    "printf '\\5\\0\\0\\0\\20\\0\\0\\0VEX Binary File\\n\\3\\0\\0\\0VEX\\1\\0\\0\\0"
    "\\4\\0\\0\\0Name\\2\\0\\0\\0A\\33\\0\\0\\0\\0\\0\\0\\0\\0%s'";

TEST_F(ToolTest, CheckTellsFaultsWithTheirPlacesAndGoesOnToTheNextFile) {
  WriteDocument("good.xml", "Set", SampleXml("a", 0.5) + LabSampleXml("b", "1", "2", "3"));
  WriteFile("bad.xml", "<VEX Version='1'>\n <Name/><Typo/><SampleSet/></VEX>");
  const Result result = Shell(
      kCache + " rest >c.bin; : >d.vexb; aldermoor check good.xml bad.xml none.xml c.bin d.vexb");
  EXPECT_EQ(result.out, R"(good.xml: in order
bad.xml:2:9: warning: 'Typo' is not read here
bad.xml:2:16: 'SampleSet' has no 'Name'
bad.xml: 1 fault, 1 warning
c.bin:0x00000039: warning: 4 bytes behind the table of conditions
c.bin: 0 faults, 1 warning
d.vexb:0x00000000: the file ends inside a number: version
d.vexb: 1 fault, 0 warnings
)");
  EXPECT_EQ(result.err, "aldermoor: none.xml: No such file or directory\n");
  EXPECT_EQ(result.status, 3);
  EXPECT_EQ(Run("check bad.xml good.xml").status, 1);
  EXPECT_EQ(Run("check c.bin - < good.xml").status, 0);
  const auto json = nlohmann::json::parse(Run("check --format json bad.xml").out)["files"][0];
  EXPECT_EQ(json["faults"][1]["column"], 16);
}

TEST_F(ToolTest, DumpShowsOffsetBytesAndMeaningUpToTheFault) {
  const Result whole = Shell(kCache + " | aldermoor dump -");
  EXPECT_EQ(whole.out, R"(00000000  05 00 00 00                                      version 5
00000004  10 00 00 00 56 45 58 20 42 69 6e 61 72 79 20 46  magic "VEX Binary File\n"
00000014  69 6c 65 0a
00000018  03 00 00 00 56 45 58                             element "VEX"
0000001f  01 00 00 00                                        1 header value
00000023  04 00 00 00 4e 61 6d 65                              key "Name"
0000002b  02 00 00 00 41 1b                                    value "A\x1b"
00000031  00 00 00 00                                        0 sample sets
00000035  00 00 00 00                                      0 condition blocks
)");
  EXPECT_EQ(whole.status, 0);
  const Result cut = Shell(kCache + " | head -c 48 | aldermoor dump -");
  EXPECT_TRUE(Holds(cut.out, "0000002b  fault: a text of 2 bytes cannot be in the 1 byte that"));
  EXPECT_EQ(cut.status, 1);
  EXPECT_EQ(Run("dump none.vexb").status, 3);
}

}  // namespace
}  // namespace Aldermoor::Tool
