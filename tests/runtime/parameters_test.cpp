// Parameter lists: separators outside escapes, binding as p1 ... pN, escaping and
// unescaping, and the lifetime of the two escape expressions' results.
#include "runtime/parameters.h"
#include "runtime/routines.h"
#include "tests/support/test_host.h"

#include <gtest/gtest.h>

#include <random>
#include <string>
#include <vector>

namespace morvex::tests {
namespace {

using namespace morvex::runtime;

struct Bound {
  std::int32_t integer;
  float real;
  std::string text;
  bool operator==(const Bound &) const = default;
};

std::ostream &operator<<(std::ostream &out, const Bound &bound) {
  return out << "{" << bound.integer << ", " << bound.real << ", \"" << bound.text << "\"}";
}

// The variables p1 ... pN that binding `list` gives, in order; checks that N is returned
// and that nothing else was bound.
std::vector<Bound> bind(const char *list) {
  VariableList variables;
  const std::int32_t count = bindParameters(list, variables);
  EXPECT_EQ(count, variables.size());
  std::vector<Bound> bound;
  for (std::int32_t k = 1; k <= count; ++k) {
    const VariableRecord *record = variables.find(("P" + std::to_string(k)).c_str());
    if (record == variables.end()) {
      ADD_FAILURE() << "p" << k << " is missing";
      break;
    }
    bound.push_back({record->value.intValue, record->value.floatValue, record->value.stringValue});
  }
  return bound;
}

std::string randomText(std::mt19937 &random) {
  // Mostly the characters that matter, with any byte now and then.
  static const std::string kAlphabet = "\\\\\\,,,a 7-.\x80\xff";
  std::string text(random() % 12, ' ');
  for (char &c : text) {
    c = random() % 4 == 0 ? static_cast<char>(1 + random() % 255)
                          : kAlphabet[random() % kAlphabet.size()];
  }
  return text;
}

TEST(FindUnescaped, SkipsEscapedCharactersWithinTheRange) {
  EXPECT_EQ(findUnescaped("a,b", ',', 0, -1), 1);
  EXPECT_EQ(findUnescaped("a\\,b,c", ',', 0, -1), 4);
  EXPECT_EQ(findUnescaped("a\\\\,b", ',', 0, -1), 3);
  EXPECT_EQ(findUnescaped("a,b,c", ',', 2, -1), 3);
  EXPECT_EQ(findUnescaped("a,b,c", ',', 2, 2), -1);
  EXPECT_EQ(findUnescaped("a,b,c", ',', -5, 1), 1);
  // A last index past the end, or below the first, means the end of the text.
  EXPECT_EQ(findUnescaped("a,b,c", ',', 2, 99), 3);
  EXPECT_EQ(findUnescaped("a,b,c", ',', 4, 0), -1);
  // A backslash is never found, nor what follows one, even at the end of the range.
  EXPECT_EQ(findUnescaped("a\\b", '\\', 0, -1), -1);
  EXPECT_EQ(findUnescaped("a\\", ',', 0, -1), -1);
  EXPECT_EQ(findUnescaped("", ',', 0, -1), -1);
  EXPECT_EQ(findUnescaped("abc", ',', 7, -1), -1);
  EXPECT_EQ(findUnescaped(nullptr, ',', 0, -1), -1);
}

TEST(BindParameters, BindsTheItemsOfAListThreeWays) {
  EXPECT_TRUE(bind("").empty());
  EXPECT_TRUE(bind(nullptr).empty());
  EXPECT_EQ(bind("1,2.5,x"),
            (std::vector<Bound>{{1, 1.0f, "1"}, {2, 2.5f, "2.5"}, {0, 0.0f, "x"}}));
  EXPECT_EQ(bind("a\\,b"), (std::vector<Bound>{{0, 0.0f, "a,b"}}));
  EXPECT_EQ(bind("a\\\\,b"), (std::vector<Bound>{{0, 0.0f, "a\\"}, {0, 0.0f, "b"}}));
  EXPECT_EQ(bind(","), (std::vector<Bound>{{0, 0.0f, ""}, {0, 0.0f, ""}}));
  EXPECT_EQ(bind(" 7"), (std::vector<Bound>{{7, 7.0f, " 7"}}));
  EXPECT_EQ(bind("ab\\"), (std::vector<Bound>{{0, 0.0f, "ab"}}));
  // Numbers are read from the raw item: an escape in front stops the reading.
  EXPECT_EQ(bind("\\-5"), (std::vector<Bound>{{0, 0.0f, "-5"}}));
}

TEST(BindParameters, NamesTheTenthItemP10AndKeepsTheListText) {
  const std::string list = "0,1,2,3,4,5,6,7,8,9,10";
  VariableList variables;
  EXPECT_EQ(bindParameters(list.c_str(), variables), 11);
  EXPECT_EQ(variables.find("p10")->value.intValue, 9);
  EXPECT_EQ(variables.find("p11")->value.stringValue, "10");
  EXPECT_EQ(variables.find("p0"), variables.end());
  EXPECT_EQ(variables.first()->name, "p1");
  EXPECT_EQ(list, "0,1,2,3,4,5,6,7,8,9,10");
}

TEST(EscapeText, EscapesBackslashesAndCommasAndUnescapesBack) {
  EXPECT_EQ(escapeText("a,b\\c"), "a\\,b\\\\c");
  EXPECT_EQ(escapeText(""), "");
  EXPECT_EQ(escapeText(nullptr), "");
  for (const auto &[escaped, plain] : std::vector<std::pair<std::string, std::string>>{
           {"a\\,b\\\\c", "a,b\\c"}, {"\\n", "n"}, {"x\\", "x"}, {"\\\\\\", "\\"}, {"", ""}}) {
    std::string text = escaped;
    unescapeText(text);
    EXPECT_EQ(text, plain) << escaped;
  }
}

TEST(EscapeText, RoundTripsArbitraryTextsThroughAParameterList) {
  std::mt19937 random(7);
  for (int round = 0; round < 500; ++round) {
    std::vector<std::string> texts(1 + random() % 5);
    std::string list;
    for (std::size_t i = 0; i < texts.size(); ++i) {
      texts[i] = randomText(random);
      std::string back = escapeText(texts[i].c_str());
      unescapeText(back);
      EXPECT_EQ(back, texts[i]);
      list += (i > 0 ? "," : "") + escapeText(texts[i].c_str());
    }
    const std::vector<Bound> bound = bind(list.c_str());
    // A list of one empty text is the empty list, which holds no items.
    if (texts.size() == 1 && texts[0].empty()) {
      EXPECT_TRUE(bound.empty());
      continue;
    }
    ASSERT_EQ(bound.size(), texts.size()) << list;
    for (std::size_t i = 0; i < texts.size(); ++i) {
      EXPECT_EQ(bound[i].text, texts[i]) << list;
    }
  }
}

TEST(FormatString, GivesAnEmptyStringResultForAMissingText) {
  TestHost host;
  RunObject &object = host.create();
  for (ExpressionFn routine : {formatString, unformatString}) {
    const Result result = host.eval(object, routine, {NullText{}});
    EXPECT_EQ(result.flags, host::kStringResult);
    EXPECT_EQ(result.text(), "");
  }
  EXPECT_EQ(object.expressionErrorCode, 0);
}

TEST(FormatString, KeepsEachResultUntilTheSecondEvaluationAfterIt) {
  TestHost host;
  RunObject &object = host.create();
  // Short texts as well as long ones: neither may move when the next result comes.
  const Result first = host.eval(object, formatString, {std::string("a,b")});
  const Result second = host.eval(object, unformatString, {std::string(100, 'x')});
  EXPECT_EQ(first.text(), "a\\,b");
  EXPECT_EQ(second.text(), std::string(100, 'x'));
  ASSERT_TRUE(object.previousStringResult);
  EXPECT_EQ(object.previousStringResult->c_str(), reinterpret_cast<const char *>(first.word));

  // The third evaluation releases the first result; the second is still there.
  const Result third = host.eval(object, formatString, {first.text()});
  EXPECT_EQ(third.text(), "a\\\\\\,b");
  EXPECT_EQ(second.text(), std::string(100, 'x'));
  EXPECT_EQ(object.previousStringResult->c_str(), reinterpret_cast<const char *>(second.word));
  EXPECT_EQ(object.stringResult->c_str(), reinterpret_cast<const char *>(third.word));
}

// A parameter fetch that hands over one text pointer as it is.
HostWord gHandedText = 0;
HostWord MORVEX_CALL handText(host::ObjectHeader *, HostWord, HostWord) {
  return gHandedText;
}

TEST(FormatString, ReadsAResultHandedBackBeforeReleasingIt) {
  TestHost host;
  RunObject &object = host.create();
  // The host may hand a result straight back; the result it reads from is still alive.
  const Result first = host.eval(object, formatString, {std::string(",")});
  const char *own = reinterpret_cast<const char *>(first.word);
  object.hostFlags = 0;
  // Evaluated with the pointer itself, not a copy of the text.
  gHandedText = reinterpret_cast<HostWord>(own);
  const host::RunService saved = host.runHeader().FetchFirstExpressionParam;
  host.runHeader().FetchFirstExpressionParam = &handText;
  const HostWord again = unformatString(object, 0);
  host.runHeader().FetchFirstExpressionParam = saved;
  EXPECT_STREQ(reinterpret_cast<const char *>(again), ",");
  EXPECT_STREQ(own, "\\,");

  // Now `own` is the older of the two results, the one the next evaluation releases: that
  // evaluation still reads it before letting it go.
  host.runHeader().FetchFirstExpressionParam = &handText;
  const HostWord third = formatString(object, 0);
  host.runHeader().FetchFirstExpressionParam = saved;
  EXPECT_STREQ(reinterpret_cast<const char *>(third), "\\\\\\,");
  EXPECT_STREQ(reinterpret_cast<const char *>(again), ",");
}

} // namespace
} // namespace morvex::tests
