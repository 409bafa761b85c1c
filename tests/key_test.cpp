#include <MW/key.h>

#include <memory>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Key;

std::string calls;  // a letter for each callback, and the code or place that it was given
template <char letter>
void noteKey(MW::kbd_event* key) {
  calls += letter + std::to_string(key->code) + '/' + std::to_string(key->state) + ' ';
}
template <char letter>
void noteTouch(MW::mouse_event* mouse) {
  calls += letter + std::to_string(mouse->x) + ',' + std::to_string(mouse->y) + ' ';
}

class KeyTest : public WidgetTest {
 protected:
  void SetUp() override {
    WidgetTest::SetUp();
    calls.clear();
    key = std::make_unique<Key>();
    platform().takeLog();
    key->keyPressCallback = noteKey<'k'>;
    key->keyReleaseCallback = noteKey<'r'>;
    key->doubleKeyCallback = noteKey<'D'>;
    key->tripleKeyCallback = noteKey<'T'>;
    key->plugCallback = noteKey<'u'>;
    key->touchPressCallback = noteTouch<'p'>;
    key->touchReleaseCallback = noteTouch<'c'>;
    key->longPressCallback = noteTouch<'l'>;
  }
  void TearDown() override {
    key.reset();
    WidgetTest::TearDown();
  }
  bool send(MW::EventCode code, unsigned int number, unsigned int state = 1) {
    return offer(*key, {.type = code, .key = {state, number}});
  }

  std::unique_ptr<Key> key;
};

TEST_F(KeyTest, TellsEachKindOfEventOnce) {
  EXPECT_FALSE(press(*key, {1, 2}));
  EXPECT_FALSE(drag(*key, {1, 2}));
  EXPECT_FALSE(release(*key, {3, 4}));
  EXPECT_TRUE(longPress(*key, {5, 6}));
  EXPECT_EQ(platform().takeLog(), logLines(kDebug, {"[KEY] long pressed!!"}));
  EXPECT_TRUE(send(MW::kEventKeyPress, 10));
  EXPECT_TRUE(send(MW::kEventKeyRelease, 11, 0));
  EXPECT_TRUE(send(MW::kEventApplication, 12));
  EXPECT_FALSE(send(MW::kEventUnknown, 13));
  EXPECT_EQ(calls, "p1,2 c3,4 l5,6 k10/1 r11/0 ");
  EXPECT_FALSE(key->onRecvEvent(nullptr, 0));
}

TEST_F(KeyTest, NeedsNoCallbacks) {
  Key deaf;
  EXPECT_TRUE(offer(deaf, keyEvent(MW::kEventUser, 17)));
  for (int code = 0; code <= 8; ++code) offer(deaf, {.type = code, .mouse = {}});
  deaf.plugCallback = noteKey<'u'>;
  platform().ticks = 5000;
  deaf.show();
  EXPECT_EQ(calls, "") << "nothing was held back for nobody";
}

struct Release {
  unsigned int code, at;
};

struct ReleaseCase : Row {
  std::vector<Release> releases;
  const char* told;
};

class KeyReleases : public KeyTest, public testing::WithParamInterface<ReleaseCase> {};

TEST_P(KeyReleases, CountsQuickOnesOfOneKey) {
  for (const Release& each : GetParam().releases) {
    platform().ticks = each.at;
    send(MW::kEventKeyRelease, each.code, 9);
  }
  EXPECT_EQ(calls, GetParam().told);
}

INSTANTIATE_TEST_SUITE_P(
    Series, KeyReleases,
    testing::Values(
        ReleaseCase{{"Four"},
                    {{5, 1000}, {5, 1300}, {5, 1600}, {5, 1900}},
                    "r5/9 D5/9 r5/9 T5/9 r5/9 r5/9 "},
        ReleaseCase{{"Others"}, {{5, 1000}, {6, 1100}, {5, 1200}}, "r5/9 r6/9 r5/9 "},
        ReleaseCase{{"After999"}, {{5, 1000}, {5, 1999}}, "r5/9 D5/9 r5/9 "},
        ReleaseCase{{"After1000"}, {{5, 1000}, {5, 2000}, {5, 2100}}, "r5/9 r5/9 D5/9 r5/9 "},
        ReleaseCase{
            {"SlowEveryTime"}, {{5, 1000}, {5, 1999}, {5, 2998}}, "r5/9 D5/9 r5/9 T5/9 r5/9 "},
        // At the wrap a step may count as too late; the one behind it counts again.
        ReleaseCase{{"AcrossTheWrap"},
                    {{5, 0xFFFFFFF0}, {5, 0xFFFFFFF8}, {5, 10}, {5, 20}},
                    "r5/9 r5/9 D5/9 r5/9 T5/9 r5/9 "},
        ReleaseCase{
            {"NoKeysNumber"}, {{65535, 10}, {65535, 20}}, "r65535/9 D65535/65535 r65535/9 "}),
    rowName);

TEST_F(KeyTest, CountingAnotherKeyEndsTheSeries) {
  platform().ticks = 1000;
  send(MW::kEventKeyRelease, 5, 9);
  key->onKeyClickCount({9, 6});
  send(MW::kEventKeyRelease, 5, 9);
  EXPECT_EQ(calls, "r5/9 r5/9 ");
}

constexpr unsigned int kDraw = 0;  // instead of a plug's code: a drawing pass

struct PlugStep {
  unsigned int code, at;
  const char* told;
};

struct PlugCase : Row {
  std::vector<PlugStep> steps;
};

class KeyPlug : public KeyTest, public testing::WithParamInterface<PlugCase> {};

TEST_P(KeyPlug, IsHeldBackUntilItHasSettled) {
  int number = 0;
  for (const PlugStep& step : GetParam().steps) {
    SCOPED_TRACE(++number);
    calls.clear();
    platform().ticks = step.at;
    if (step.code == kDraw) {
      key->show(0);
    } else {
      EXPECT_TRUE(send(MW::kEventUser, step.code, 3));
    }
    EXPECT_EQ(calls, step.told);
  }
}

INSTANTIATE_TEST_SUITE_P(
    Plugs, KeyPlug,
    testing::Values(
        PlugCase{{"Two"},
                 {{2, 1000, ""}, {kDraw, 1100, ""}, {kDraw, 1101, "u2/3 "}, {kDraw, 9000, ""}}},
        PlugCase{{"Seventeen"}, {{17, 1000, ""}, {kDraw, 1101, "u2/3 "}, {kDraw, 9000, ""}}},
        PlugCase{{"Eighteen"}, {{18, 1000, ""}, {kDraw, 1101, "u2/3 "}}},
        PlugCase{{"Bounces"},
                 {{17, 1000, ""}, {18, 1050, ""}, {kDraw, 1150, ""}, {kDraw, 1151, "u2/3 "}}},
        PlugCase{{"AnotherBehindTwo"}, {{2, 1000, ""}, {5, 1050, "u5/3 "}, {kDraw, 9000, ""}}},
        PlugCase{{"AnotherBehindSeventeen"},
                 {{17, 1000, ""}, {5, 1050, ""}, {kDraw, 1101, "u2/3 "}, {5, 1200, "u5/3 "}}},
        PlugCase{{"AnotherFirst"}, {{5, 1000, ""}, {kDraw, 9000, ""}}},
        PlugCase{{"AcrossTheWrap"},
                 {{2, 0xFFFFFFF0, ""}, {kDraw, 50, ""}, {kDraw, 85, "u2/3 "}, {kDraw, 90, ""}}}),
    rowName);

}  // namespace
