// The command line: commands, options and the errors of wrong ones (a missing command
// and an unreadable number are also run end to end as emulator.no_command and bad_option).
#include "emulator/command_line.h"

#include <gtest/gtest.h>

namespace morvex::tests {
namespace {

using emulator::CommandLine;

std::optional<CommandLine> parse(std::vector<std::string> arguments, std::string *error = nullptr) {
  std::string ignored;
  return emulator::parseCommandLine(arguments, error ? *error : ignored);
}

TEST(CommandLine, PlayTakesASheetAndOptionsInAnyOrder) {
  const std::optional<CommandLine> line =
      parse({"play", "--trace", "game.events", "--frames", "3", "--max-depth", "50", "--max-steps",
             "1000", "--library", "lib.so"});
  ASSERT_TRUE(line);
  EXPECT_EQ(line->command, CommandLine::Command::Play);
  EXPECT_EQ(line->sheet, "game.events");
  EXPECT_TRUE(line->play.trace);
  EXPECT_EQ(line->play.frames, 3);
  EXPECT_EQ(line->play.maxDepth, 50);
  EXPECT_EQ(line->play.maxSteps, 1000);
  EXPECT_EQ(line->library, "lib.so");
}

TEST(CommandLine, DefaultsToOneFrameAndTheLimitsOfTheHost) {
  const std::optional<CommandLine> line = parse({"play", "game.events"});
  ASSERT_TRUE(line);
  EXPECT_EQ(line->play.frames, 1);
  EXPECT_FALSE(line->play.trace);
  EXPECT_EQ(line->play.maxDepth, 10000);
  EXPECT_EQ(line->play.maxSteps, 100000000);
  EXPECT_EQ(parse({"menus"})->command, CommandLine::Command::Menus);
}

TEST(CommandLine, RejectsWhatItDoesNotUnderstand) {
  std::string error;
  EXPECT_FALSE(parse({"run"}, &error));
  EXPECT_EQ(error, "unknown command \"run\"");
  EXPECT_FALSE(parse({"play"}, &error));
  EXPECT_EQ(error, "play needs a sheet to play");
  EXPECT_FALSE(parse({"play", "a.events", "b.events"}, &error));
  EXPECT_EQ(error, "unexpected argument \"b.events\"");
  EXPECT_FALSE(parse({"play", "a.events", "--frames"}, &error));
  EXPECT_EQ(error, "--frames needs a value");
  EXPECT_FALSE(parse({"play", "a.events", "--frames", "-1"}, &error));
  EXPECT_FALSE(parse({"play", "a.events", "--max-depth", "2000000"}, &error));
  EXPECT_EQ(error, "--max-depth takes a whole number from 0 to 1000000, not \"2000000\"");
  EXPECT_FALSE(parse({"menus", "--trace"}, &error));
  EXPECT_EQ(error, "unexpected argument \"--trace\"");
}

} // namespace
} // namespace morvex::tests
