// The drawing passes of single widgets, each against the same drawing calls made by hand. How many
// calls of which kind a pass makes, the golden item lists say.
#include <MW/MW.h>
#include <benchmark/benchmark.h>
#include <brimol/frame.h>

#include <string>
#include <vector>

#include "passes.h"

namespace {

constexpr SKIA_Rect kScreen = {0, 0, 1440, 2560, 0xFFE0E0E0};  // the size while none is known

// What a drawing pass of one widget calls.
struct Calls {
  SKIA_ItemKind kind;
  int count;
};

void addItem(const SKIA_Item& item) {
  switch (item.kind) {
    case SKIA_LABEL: skia_add_label_c(item.rect, item.text); break;
    case SKIA_TEXTBOX: skia_add_textbox_c(item.rect, item.text); break;
    case SKIA_BUTTONBOX: skia_add_buttonbox_c(item.rect, item.text); break;
    case SKIA_STATICBOX: skia_add_staticbox_c(item.rect, item.text); break;
    case SKIA_ROUNDTEXTBOX: skia_add_roundtextbox_c(item.rect, item.text); break;
    case SKIA_ROUNDBOX: skia_add_roundbox_c(item.rect); break;
    case SKIA_LINE: skia_add_line_c(item.point); break;
    default: skia_add_box_c(item.rect); break;
  }
}

// The drawing pass over one widget against the calls that it makes, made by hand.
void compareWidget(benchmark::State& state, MW::Widget& widget, const std::vector<Calls>& calls) {
  std::vector<SKIA_Item> items;
  for (const Calls& each : calls) {
    items.insert(items.end(), static_cast<std::size_t>(each.count), {each.kind, {}, {}, {}});
  }
  widget.setActive(1);
  const auto pass = [] {
    skia_begin_frame_c();
    MW::Window::show(kTicks);
  };
  const auto bare = [&items] {
    skia_begin_frame_c();
    for (const SKIA_Item& item : items) addItem(item);
  };
  compare(state, static_cast<int>(items.size()), pass, bare);
}

// A main menu of 64 rows. The first one begins where the list does and is not drawn.
void mainListPass(benchmark::State& state) {
  constexpr int kRowHeight = 20;  // pixels: all of them are in view
  MW::MainList list("A menu", 1);
  const Face face;
  for (int i = 0; i < MW::MainList::kItems; ++i) {
    list.addIndex(MW::MainList::kSelectable, &face.text, kRowHeight);
  }
  list.initFinish();
  compareWidget(state, list,
                {{SKIA_TEXTBOX, MW::MainList::kItems - 1}, {SKIA_BOX, 2}, {SKIA_LABEL, 9}});
}

// A dialog of two buttons.
void dialogPass(benchmark::State& state) {
  MW::Dialog dialog(0);
  compareWidget(
      state, dialog,
      {{SKIA_BOX, 4}, {SKIA_LINE, 1}, {SKIA_LABEL, 2}, {SKIA_ROUNDBOX, 2}, {SKIA_ROUNDTEXTBOX, 2}});
}

// Of each kind of dialog with buttons: its frame, title and the two buttons.
std::vector<Calls> framedCalls(Calls body) {
  return {{SKIA_BOX, 4},      {SKIA_LINE, 1},         {SKIA_LABEL, 1},
          {SKIA_ROUNDBOX, 2}, {SKIA_ROUNDTEXTBOX, 2}, body};
}

void dialogNewPass(benchmark::State& state) {
  MW::DialogNew dialog("A sensor", SKIA_ALIGN_CENTRE, -1);
  dialog.setDesc("It did not answer.", "Clean it and try again,", "or mark it as failed.");
  dialog.setbutton("Fail", "Again");
  compareWidget(state, dialog, framedCalls({SKIA_LABEL, MW::DialogNew::kLines}));
}

// Eight rows, of which one is marked.
void dialogListPass(benchmark::State& state) {
  MW::DialogList dialog("Which of them?");
  for (int i = 0; i < MW::DialogList::kRows; ++i) dialog.addIndex("A row");
  dialog.initFinish(0);
  std::vector<Calls> calls = framedCalls({SKIA_TEXTBOX, MW::DialogList::kRows});
  calls.push_back({SKIA_BOX, MW::DialogList::kRows + 1});
  compareWidget(state, dialog, calls);
}

void dialogShellPass(benchmark::State& state) {
  MW::DialogShell dialog("uname -a");
  for (int i = 0; i < MW::DialogShell::kLines; ++i) dialog.addShell("A line of the output");
  compareWidget(state, dialog, framedCalls({SKIA_TEXTBOX, MW::DialogShell::kLines}));
}

void keyboardPass(benchmark::State& state) {
  const Face face;
  MW::Ime keyboard(&kScreen, &face.text);
  constexpr int kKeys = 42;
  compareWidget(state, keyboard, {{SKIA_BOX, 1}, {SKIA_BUTTONBOX, kKeys}});
}

// Numbers, a scroll bar, and a search that found nothing.
void textViewerPass(benchmark::State& state) {
  SKIA_Text looks = {};
  looks.size = 40;
  constexpr int kRows = 62;  // in view
  MW::StaticText viewer(&kScreen, &looks, true, true, true);
  std::string log;
  for (int i = 0; i < 2 * kRows; ++i) log += "A line of the log, not a long one\n";
  viewer.setText(log.c_str());
  compareWidget(state, viewer, {{SKIA_BOX, 2}, {SKIA_LABEL, 2 * kRows}});
}

// 64 results, all of them in view on a screen that is high enough.
void resultListPass(benchmark::State& state) {
  constexpr int kRows = MW::MpdWid::kItems;
  MW::Window::width = kScreen.w;
  MW::Window::height = 12000;
  MW::MpdWid list("Results");
  MW::Window::width = MW::Window::height = 0;
  std::string results;
  for (int i = 0; i < kRows; ++i) results += "[1] 10:01 [MPDIA] Battery]3.9 V\n";
  list.cal_line(results.data(), static_cast<int>(results.size()));
  compareWidget(state, list, {{SKIA_TEXTBOX, 4 * kRows}, {SKIA_STATICBOX, kRows}, {SKIA_BOX, 2}});
}

void padPass(benchmark::State& state) {
  constexpr int kEightCells = 3;
  MW::Button8 pad(kEightCells, &kScreen, nullptr);
  compareWidget(state, pad,
                {{SKIA_ROUNDBOX, MW::Button8::kCells}, {SKIA_LABEL, MW::Button8::kCells}});
}

void valueSliderPass(benchmark::State& state) {
  MW::SlideMove slider(&kScreen, 0, 0, 100, 50);
  compareWidget(state, slider, {{SKIA_BOX, 5}, {SKIA_TEXTBOX, 1}});
}

BENCHMARK(mainListPass)->Name("drawing/main list of 64 rows");
BENCHMARK(resultListPass)->Name("drawing/list of 64 results");
BENCHMARK(textViewerPass)->Name("drawing/text viewer of 62 rows");
BENCHMARK(keyboardPass)->Name("drawing/keyboard");
BENCHMARK(dialogPass)->Name("drawing/Dialog");
BENCHMARK(dialogNewPass)->Name("drawing/DialogNew of three lines");
BENCHMARK(dialogListPass)->Name("drawing/DialogList of eight rows");
BENCHMARK(dialogShellPass)->Name("drawing/DialogShell of 25 lines");
BENCHMARK(padPass)->Name("drawing/Button8 of eight cells");
BENCHMARK(valueSliderPass)->Name("drawing/SlideMove with its value");

}  // namespace
