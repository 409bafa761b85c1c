#include "core/layer.h"

#include <MW/widget.h>
#include <gtest/gtest.h>

#include <array>
#include <vector>

#include "core/layer_walk.h"

namespace {

/// Forty widgets and a layer; layers are never freed.
class LayerTest : public testing::Test {
 protected:
  void append(int widget) { at(widget).setId(layer.append(&at(widget))); }
  MW::Widget& at(int widget) { return widgets.at(static_cast<std::size_t>(widget)); }
  void TearDown() override {
    for (MW::Widget& widget : widgets) layer.removeAll(&widget);
  }
  /// The widgets that a walk meets, by their places in `widgets`.
  std::vector<long> met() {
    std::vector<long> found;
    MW::LayerWalk walk(layer);
    while (const MW::Widget* const widget = walk.next()) found.push_back(widget - widgets.data());
    return found;
  }

  static inline MW::Layer layer;
  std::array<MW::Widget, 40> widgets;
};

using Met = std::vector<long>;

TEST_F(LayerTest, KeepsTheOrderAsItGrowsAndShrinks) {
  EXPECT_TRUE(layer.isEmpty());
  for (int i = 0; i < 40; ++i) append(i);
  for (int i = 0; i < 38; ++i) EXPECT_EQ(layer.removeAll(&at(i)), 1);
  EXPECT_EQ(met(), (Met{38, 39}));
  append(5);
  EXPECT_EQ(met(), (Met{38, 39, 5}));
  EXPECT_EQ(at(5).id(), 3) << "the number that it then holds";
  EXPECT_FALSE(layer.isEmpty());
}

TEST_F(LayerTest, RemovesTheFirstOfANumberOrEveryEntryOfAWidget) {
  for (const int widget : {0, 1, 2, 1}) append(widget);
  at(2).setId(1);
  EXPECT_EQ(layer.removeFirst(1), &at(0));
  EXPECT_EQ(layer.removeFirst(1), &at(2));
  EXPECT_EQ(layer.removeFirst(1), nullptr);
  EXPECT_EQ(met(), (Met{1, 1}));
  EXPECT_EQ(layer.removeAll(&at(1)), 2);
  EXPECT_EQ(layer.removeAll(&at(1)), 0);
  EXPECT_TRUE(layer.isEmpty());
}

TEST_F(LayerTest, AWalkMeetsWhatStoodThereWhenItBegan) {
  for (const int widget : {0, 1, 2}) append(widget);
  MW::LayerWalk walk(layer);
  EXPECT_EQ(walk.next(), &at(0));
  layer.removeAll(&at(1));
  for (int i = 3; i < 40; ++i) append(i);
  EXPECT_EQ(walk.next(), &at(2)) << "though the layer has moved to a wider block";
  EXPECT_EQ(walk.next(), nullptr);
}

}  // namespace
