// The language by itself: values, operators, variables, blocks, and what the grammar refuses.
#include <gtest/gtest.h>

#include <limits>

#include "tests/tarnscript/fakes.h"

namespace tarnscript {
namespace {

struct Case {
  const char* source;
  const char* expected;
};

void expectAll(std::initializer_list<Case> cases) {
  for (const auto& [source, expected] : cases) EXPECT_EQ(runScript(source), expected) << source;
}

TEST(Language, CalculatesAndCompares) {
  expectAll({
      {"1 + 2 * 3 - 4", "3"},
      {"(1 + 2) * -3", "-9"},
      {"7 / 2", "3.5"},
      {"8 / 2", "4.0"},
      {"-7 div 2", "-3"},
      {"-7 mod 2", "-1"},
      {"7.5 div 2", "3"},
      {"{7.5 mod 2, 1.5 - 2, 1.5 * 2, 2 + 1.5, -(1.5)}", "{1.5, -0.5, 3.0, 3.5, -1.5}"},
      {"{1e+2, 1e-2, -1e300 div 1e299}", "{100.0, 0.01, -10}"},
      {"9223372036854775807 + 1", "9223372036854775808.0"},
      {"{9223372036854775807 * 2, -1e19 div 1}", "{18446744073709551616.0, -1e+19}"},
      {"9223372036854775808", "9223372036854775808.0"},
      {"(-9223372036854775807 - 1) div -1", "9223372036854775808.0"},
      {"(-9223372036854775807 - 1) mod -1", "0"},
      {"- (-9223372036854775807 - 1)", "9223372036854775808.0"},
      {"1e308 * 10", "error 1: the result is too large"},
      {"1 div 0", "error 1: division by zero"},
      {"1.5 mod 0.0", "error 1: division by zero"},
      {"1 + \"a\"", "error 1: cannot calculate with an integer and a text"},
      {"true + 1", "error 1: cannot calculate with a boolean and an integer"},
      {"-\"a\"", "error 1: cannot calculate with an integer and a text"},
      {"1 is 1.0", "true"},
      {"0.5 is -0.5", "false"},
      {"\"ABC\" is \"abc\" and \"a\" < \"B\"", "true"},
      {"{1, \"A\"} is {1.0, \"a\"}", "true"},
      {"\"ab\" < \"ABC\"", "true"},
      {"{1 is \"1\", 1 is 1.5}", "{false, false}"},
      {"1 < \"2\"", "error 1: cannot order an integer and a text"},
      {"\"2\" < 1", "error 1: cannot order a text and an integer"},
      {"{1 is not 2, 1 \u2260 2, 1 /= 2, 1 is not equal to 2, 1 = 2, 1 equals 2, 1 is equal to 2}",
       "{true, true, true, true, false, false, false}"},
      {"{1 < 2, 1\u22642, 2 is less than 2, 2 is less than or equal to 2}", "{true, true, false, true}"},
      {"{1 > 2, 2\u22651, 3 is greater than 2, 1 >= 2, 1 is greater than or equal to 2}",
       "{false, true, true, false, false}"},
      {"not 1 is 2 and false or true", "true"},
      {"false and 1 div 0 is 1 or false", "false"},
      {"true or 1", "true"},
      {"not 1", "error 1: expected true or false, not an integer"},
      {"\"a\" & 1 & 1.5", "\"a11.5\""},
      {"true & \"a\"", "error 1: cannot calculate with a boolean and a text"},
      {"\"a\" & true", "error 1: cannot calculate with a text and a boolean"},
      {"0 & {1} & 2 & {3, {4}}", "{0, 1, 2, 3, {4}}"},
      {"\"say\t\\\"hi\\\"\\n\" & \"caf\u00e9\"", "\"say\t\"hi\"\ncaf\u00e9\""},
      {"count \"caf\u00e9\"", "4"},
      {"count of {1, 2} + (count of {})", "2"},
      {"count 5", "error 1: cannot count an integer"},
  });
}

TEST(Language, ListsAndVariables) {
  expectAll({
      {"set x to {10, 20, 30}\nitem 2 of the x", "20"},
      {"set X to {10, 20, 30}\n{first item of x, LAST ITEM OF x, item -2 of x}", "{10, 30, 20}"},
      {"set x to {10}\nitem 2 of x", "error 2: there is no such item"},
      {"set x to {10}\nitem 0 of x", "error 2: there is no such item"},
      {"set x to {10}\nitem \"a\" of x", "error 2: expected a whole number, not a text"},
      {"{item 2.0 of {1, 2}, item 1.5 of {1}}", "error 1: expected a whole number, not a real"},
      {"every item of {1, 2}", "{1, 2}"},
      {"item id 1 of {1, 2}", "error 1: there is no such item"},
      {"item 1 of 5", "error 1: an integer has no elements of the class 'item'"},
      {"{1, 2}'s last item", "2"},
      {"\n\nunset", "error 3: the variable 'unset' is not set"},
      {"set x to 1\nset x to x + 1", "2"},
  });
}

TEST(Language, BlocksAndTheirResults) {
  expectAll({
      {"", "none"},
      {"set n to 0\nrepeat with i from 1 to 5\nset n to n + i\nend repeat", "15"},
      {"set n to 0\nrepeat with i from 5 to 1 by -2\nset n to n * 10 + i\nend", "531"},
      {"repeat with i from 1 to 0\nend\ni", "error 3: the variable 'i' is not set"},
      {"repeat with i from 9223372036854775806 to 9223372036854775807\ni\nend", "9223372036854775807"},
      {"repeat with i from 1 to 2 by 0\nend", "error 1: a repeat cannot go by 0"},
      {"set n to 1\nrepeat 3 times\nset n to n * 2\nend repeat", "8"},
      {"set n to 1\nrepeat while n < 100\nset n to n * 2\nend repeat\nn", "128"},
      {"set n to 1\nrepeat until n >= 100\nset n to n * 3\nend repeat\nn", "243"},
      {"set n to 0\nrepeat\nset n to n + 1\nif n is 4 then exit repeat\nend repeat\nn", "4"},
      {"set n to 0\nrepeat 3 times\nset n to n + 1\nrepeat with i from 1 to 9\nset n to n * 2\nexit repeat\n"
       "end\nexit repeat\nend\nn",
       "2"},
      {"repeat 3 times\nrepeat\nrepeat with i from 1 to 2\nreturn 7\nend\nend\nend repeat\n8", "7"},
      {"5\nreturn\n8", "none"},
      {"repeat while 1\nend", "error 1: expected true or false, not an integer"},
      {"if false then 1", "none"},
      {"if false then 1 else if true then 2 else 3", "2"},
      {"if true then if false then 1 else 2", "2"},
      {"if false then\n1\nelse if true\n2\nelse\n3\nend if", "2"},
      {"if false\n1\nelse if false then\n2\nelse\n3\nend", "3"},
      {"if true then\n-- a comment\n1 # another\nend if -- and a third", "1"},
      {"if true then\r\n1\r\nend if\r\nunset\r\n", "error 4: the variable 'unset' is not set"},
      {"set x to 1\nif false then\nelse if x div 0 is 1 then\nend if", "error 3: division by zero"},
  });
}

TEST(Language, RefusesWhatTheGrammarDoesNotKnow) {
  expectAll({
      {"set x to", "error 1: expected a value, found the end of the line"},
      {"1\nset foo bar to 3", "error 2: expected 'to', found 'bar'"},
      {"set 5 to 3", "error 1: only a variable or a property can be set"},
      {"if true 1", "error 1: expected 'then', found '1'"},
      {"if true then\n1", "error 2: expected 'end if', found the end of the script"},
      {"if true then\n1\nend tell", "error 3: expected 'end if', found 'tell'"},
      {"end", "error 1: expected a statement, found 'end'"},
      {"exit repeat", "error 1: 'exit repeat' stands outside a repeat"},
      {"repeat with 5 from 1 to 2\nend", "error 1: expected a variable, found '5'"},
      {"repeat 5\nend", "error 1: expected 'times', found the end of the line"},
      {"ignoring case\nend", "error 1: expected 'application responses', found 'case'"},
      {"(1", "error 1: expected ')', found the end of the line"},
      {"{1, 2", "error 1: expected '}', found the end of the line"},
      {"x of y", "error 1: expected the end of the line, found 'of'"},
      {"1\n\"open", "error 2: a text has no closing quote"},
      {"\"bad \\q\"", "error 1: a text holds an unknown escape"},
      {"1\n2 ; 3", "error 2: unexpected character"},
      {"1\n\"\xff\"", "error 2: the source is not valid UTF-8"},
      {"\"\xed\xa0\x80\"", "error 1: the source is not valid UTF-8"},
      {"1e999", "error 1: the number is out of range"},
      {"tell application \"Nowhere\"\nend", "error 1: application \"Nowhere\" is not installed"},
      {"set x to \"Keyhouse\"\ntell application x to launch",
       "error 2: expected the application's name or identifier as a text, found 'x'"},
      {"it", "error 1: no application is told here"},
      {"tell 5 to launch", "error 1: only an application or one of its objects can be told"},
  });
  EXPECT_EQ(runScript(std::string_view("1\0 2", 4)), "error 1: unexpected character");
}

TEST(Language, ValuesAsNumbersAndCodes) {
  const auto list = std::make_shared<const std::vector<Value>>();
  const std::initializer_list<std::pair<Value, std::int32_t>> numbers = {
      {Value{}, 0},
      {true, 1},
      {false, 0},
      {std::int64_t{-7}, -7},
      {std::numeric_limits<std::int64_t>::max(), std::numeric_limits<std::int32_t>::max()},
      {-1.9, -1},
      {-1e300, std::numeric_limits<std::int32_t>::min()},
      {std::numeric_limits<double>::quiet_NaN(), 0},
      {std::string("12"), 0},
      {Constant{code("kPSP")}, 0},
      {List(list), 0},
  };
  for (const auto& [value, expected] : numbers) EXPECT_EQ(toInt32(value), expected) << show(value);
  EXPECT_EQ(toTypeCode(Constant{0x6b505350}), code("kPSP"));
  EXPECT_EQ(toTypeCode(std::int64_t{5}), 0U);
}

}  // namespace
}  // namespace tarnscript
