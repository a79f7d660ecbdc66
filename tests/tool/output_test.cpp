#include <gtest/gtest.h>

#include "toolrun.h"

namespace Aldermoor::Tool {
namespace {

class OutputTest : public ToolTest {
 protected:
  OutputTest() {
    WriteDocument("a.xml", "Set", SampleXml("gray", 0.5));
    WriteFile("broken.xml", "<VEX Version='1.0'>\n  <Name></Nome></VEX>");
  }
};

TEST_F(OutputTest, StandardInputAndOutputTakeTheDash) {
  const Result file = Run("color a.xml --format csv");
  const Result pipe = Shell("cat a.xml | aldermoor color - --format csv --output -");
  EXPECT_EQ(pipe.status, 0) << pipe.err;
  EXPECT_EQ(pipe.out, file.out);
  EXPECT_NE(file.out, "");
}

TEST_F(OutputTest, UnreadableInputIsReportedWithItsPlaceAndTheOthersGoOn) {
  const Result result = Run("color broken.xml nix.xml . a.xml --sample nobody");
  EXPECT_EQ(result.status, 3) << "counts more than the sample that is not there";
  EXPECT_TRUE(Holds(result.err, "aldermoor: broken.xml:2:"));
  EXPECT_TRUE(Holds(result.err, "nix.xml: No such file or directory"));
  EXPECT_TRUE(Holds(result.err, ".: Is a directory"));
  EXPECT_TRUE(Holds(result.err, "no sample 'nobody'"));
  EXPECT_EQ(ParseCsv(Run("color broken.xml a.xml --format=csv").out).size(), 2U);
  const Result stream = Shell("aldermoor color - < broken.xml");
  EXPECT_EQ(stream.status, 3);
  EXPECT_TRUE(Holds(stream.err, "<standard input>:2:"));
}

TEST_F(OutputTest, FileIsReplacedWholeOrNotAtAll) {
  WriteFile("old.csv", "old");
  EXPECT_EQ(Shell("ln -s old.csv link.csv; chmod 640 old.csv").status, 0);
  EXPECT_EQ(Run("color broken.xml --output old.csv").status, 3);
  EXPECT_EQ(ReadFile("old.csv"), "old");
  // The limit of file size, in blocks of 512 or 1024 bytes, stands for a full disk.
  const std::string many = "aldermoor color $(yes a.xml | head -200) --format csv --output old.csv";
  const Result full = Shell("trap '' XFSZ; ulimit -f 1; " + many);
  EXPECT_EQ(full.status, 4);
  EXPECT_EQ(full.err, "aldermoor: old.csv cannot be written: File too large\n");
  EXPECT_EQ(ReadFile("old.csv"), "old");
  EXPECT_EQ(Run("color a.xml --output link.csv --format=csv").status, 0);
  EXPECT_EQ(ReadFile("old.csv"), Run("color a.xml --format=csv").out);
  EXPECT_EQ(Shell("test -L link.csv && stat -c %a old.csv").out, "640\n");
  EXPECT_EQ(Shell("LC_ALL=C ls -A").out, "a.xml\nbroken.xml\nlink.csv\nold.csv\n");
  EXPECT_EQ(Shell("ln -s new.csv far && ln -s far near").status, 0);
  EXPECT_EQ(Run("color a.xml -o near --format csv").status, 0);
  EXPECT_EQ(Shell("test -L near && test -L far && cmp new.csv old.csv").status, 0)
      << "links stay although nothing was there yet";
}

TEST_F(OutputTest, FailingOutputIsAnError) {
  for (const char* command : {"color a.xml", "info a.xml", "info --format json a.xml", "--help"}) {
    const Result result = Shell(std::string("aldermoor ") + command + " > /dev/full");
    EXPECT_EQ(result.status, 4) << command;
    EXPECT_TRUE(Holds(result.err, "No space left on device"));
  }
  EXPECT_EQ(Run("color a.xml --output /dev/full").status, 4);
  EXPECT_EQ(Shell("test -c /dev/full").status, 0) << "a device is written, not replaced";
  EXPECT_EQ(Run("color a.xml --output nix/out").status, 4);
  const Result closed = Shell("aldermoor color a.xml >&-");
  EXPECT_EQ(closed.status, 4);
  EXPECT_TRUE(Holds(closed.err, "standard output cannot be written"));
}

TEST_F(OutputTest, NoInputIsReplacedByWhatIsNoDocument) {
  WriteFile("a.csv", "Name\nx\n");
  ASSERT_EQ(Shell("mkdir d; ln -s ../a.xml d/link; ln a.xml hard; cp a.xml lamp.xml; "
                  "aldermoor cache --rebuild a.xml > /dev/null; cp a.xml before; "
                  "cp Cache/a.vexb cache")
                .status,
            0);
  const char* const cases[] = {
      "color a.xml -o a.xml",
      "color a.xml -o ./d/../a.xml",
      "color a.xml -o d/link",
      "color d/link -o a.xml",
      "color a.xml -o hard",
      "color a.xml -o Cache/a.vexb",
      "color lamp.xml --illuminant @a.xml:Set/gray -o a.xml",
      "color - -o a.xml < a.xml",
      "color a.xml >> a.xml",
      "color a.xml -o /dev/stdout >> a.xml",
      "convert a.xml - >> a.xml",
      "info a.xml -o a.xml",
      "check a.xml -o a.xml",
      "check lamp.xml Cache/a.vexb -o Cache/a.vexb",
      "dump Cache/a.vexb -o Cache/a.vexb",
      "diff a.xml lamp.xml -o a.xml",
      "diff lamp.xml a.xml -o a.xml",
      "density a.xml -o a.xml",
      "light a.xml -o a.xml",
      "classify a.xml -o a.xml",
      "metamerism lamp.xml a.xml -o a.xml",
      "spectrum --input a.xml -o a.xml",
      "spectrum --input a.xml --save a.xml",
  };
  for (const char* const command : cases) {
    const Result result = Run(command);
    EXPECT_EQ(result.status, 2) << command << result.err;
    EXPECT_TRUE(Holds(result.err, "would be written over the input ")) << command;
    EXPECT_EQ(Shell("cmp before a.xml && cmp cache Cache/a.vexb").status, 0) << command;
    EXPECT_EQ(Shell("test -L d/link && test a.xml -ef hard").status, 0) << command;
  }
  EXPECT_EQ(Run("spectrum 50,0,0 --save new -o d/../new").status, 2) << "two outputs in one";
  EXPECT_EQ(Shell("ls | grep -c '\\.......$'").out, "0\n") << "no temporary file is left";
}

TEST_F(OutputTest, NothingIsWrittenOverWhatBelongsToAnInput) {
  WriteFile("a.csv", "Name\nx\n");
  ASSERT_EQ(Shell("mkdir up; mv a.xml up/a.XML; cp up/a.XML v.xml; cp v.xml new.xml;"
                  "ln -s v.xml l.xml; ln -s Cache/v.vexb lc; ln -s Cache store;"
                  "aldermoor cache --rebuild v.xml up/a.XML > /dev/null")
                .status,
            0);
  const char* const everything = "find . -type f | sort | xargs cksum";
  const std::string before = Shell(everything).out;
  const char* const cases[] = {
      "dump Cache/v.vexb -o v.xml",
      "dump lc -o l.xml",
      "dump store/v.vexb -o v.xml",
      "dump - -o v.xml < Cache/v.vexb",
      "dump Cache/v.vexb >> v.xml",
      "dump up/Cache/a.vexb -o up/a.XML",
      "check Cache/v.vexb -o v.xml",
      "check v.xml Cache/v.vexb.stamp -o v.xml",
      "check up/a.XML Cache/v.vexb -o l.xml",
      "color v.xml -o Cache/v.vexb",
      "color v.xml -o Cache/v.vexb.stamp",
      "color l.xml -o Cache/v.vexb",
      "color l.xml -o lc",
      "color - -o store/v.vexb < v.xml",
      "color new.xml -o Cache/new.vexb",
      "color new.xml -o Cache/new.vexb.stamp",
      "spectrum --input v.xml --save Cache/v.vexb",
      "extract v.xml --set Set -o Cache/v.vexb",
      "extract v.xml --set Set -o Cache/v.vexb.stamp",
      "merge new.xml l.xml -o lc",
      "convert v.xml Cache/v.vexb",
      "convert v.xml --to csv v.xml",
      "convert l.xml --to csv v.xml",
      "convert a.csv a.csv --to xml",
  };
  for (const char* const command : cases) {
    const Result result = Run(command);
    EXPECT_EQ(result.status, 2) << command << result.err;
    EXPECT_TRUE(Holds(result.err, "would be written over the input ")) << command;
    EXPECT_EQ(Shell(everything).out, before) << command;
  }
  EXPECT_EQ(Run("dump Cache/v.vexb -o new.xml").status, 0) << "another document";
  EXPECT_EQ(Run("convert v.xml v.xml").status, 0) << "which writes the cache too";
}

TEST_F(OutputTest, DocumentThatTakesThePlaceOfItsInputSaysSo) {
  WriteFile("a.csv", "Name\nx\n");
  for (const std::string command :
       {"convert a.xml d/a.xml", "merge lamp.xml a.xml -o d/a.xml",
        "extract a.xml --set Set -o d/a.xml", "convert a.csv d/../a.csv"}) {
    ASSERT_EQ(Shell("mkdir -p d; ln -sf ../a.xml d/a.xml; cp a.xml lamp.xml").status, 0);
    const Result result = Run(command);
    EXPECT_EQ(result.status, 0) << command << result.err;
    EXPECT_TRUE(Holds(result.err, ": the input is replaced\n")) << command;
    EXPECT_EQ(Run("check a.xml").status, 0) << command;
  }
  EXPECT_FALSE(Holds(Run("convert a.xml new.xml").err, "replaced"));
}

TEST_F(OutputTest, ReaderThatWentAwayEndsTheRunQuietly) {
  const Result result = Shell("{ sleep 0.2; aldermoor color a.xml; echo $? > status; } | true");
  EXPECT_EQ(ReadFile("status"), "4\n");
  EXPECT_EQ(result.err, "");
}

TEST_F(OutputTest, ClosedStandardErrorDoesNotEndUpInTheOutput) {
  EXPECT_EQ(Shell("aldermoor color broken.xml a.xml --output out.csv --format=csv 2>&-").status, 3);
  EXPECT_EQ(ReadFile("out.csv").find("aldermoor:"), std::string::npos);
  EXPECT_EQ(ReadFile("out.csv").find("file,set,sample"), 0U);
}

}  // namespace
}  // namespace Aldermoor::Tool
