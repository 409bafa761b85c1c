"use strict";
const session = JSON.parse(document.getElementById("session").textContent);
const byId = (id) => document.getElementById(id);

// An element with texts, other elements, and nothing that is read as HTML.
function make(name, properties, ...children) {
  const element = document.createElement(name);
  for (const [key, value] of Object.entries(properties || {})) {
    if (key in element && key !== "style") element[key] = value;
    else element.setAttribute(key, value);
  }
  element.append(...children.filter((child) => child !== null && child !== ""));
  return element;
}

const seconds = (ms) => (ms / 1000).toFixed(3) + " s";
const plural = (count, word) => count + " " + word + (count === 1 ? "" : "s");
const linkTo = (file) => file.split("/").map(encodeURIComponent).join("/");
const png = (base64) => "data:image/png;base64," + base64;

// The verdict.

const tones = {passed: "good", failed: "bad", crashed: "bad", hung: "bad", unusable: "bad"};

function showVerdict() {
  document.title = session.verdict[0].toUpperCase() + session.verdict.slice(1) + ": " + session.headline;
  byId("verdict").classList.add(tones[session.verdict] || "warn");
  byId("badge").textContent = session.verdict;
  byId("headline").textContent = session.headline;
  // What failed tells it once more, and in full.
  const isToldBelow = session.failures.some((failure) => failure.why === session.detail);
  byId("detail").textContent = isToldBelow ? "" : session.detail;
  byId("where").textContent = session.where;
  for (const [name, value] of session.facts) {
    byId("facts").append(make("div", {}, make("dt", {}, name), make("dd", {}, value)));
  }
  for (const [name, value] of session.about) {
    byId("about").append(make("dt", {}, name), make("dd", {}, value));
  }
  for (const note of session.notes) byId("notes").append(make("li", {}, note));
  byId("notes").hidden = session.notes.length === 0;
  byId("output-text").textContent = session.output;
  byId("output").hidden = session.output === "";
}

// Pictures: all thumbnails of the page, in its order, can be enlarged and walked through.

const plates = [];
let fixedPlates = 0;  // those that stay when the frames are shown anew

function thumbnail(index, title, shows, touches) {
  const picture = index === null || index === undefined ? null : session.pictures[index];
  if (!picture) return make("div", {className: "thumb none"}, "no picture");
  const plate = {picture, title, shows};
  const button = make("button", {type: "button", className: "thumb", "aria-label": "Enlarge " + title});
  const small = picture.thumb || picture.full;
  if (small) {
    button.append(make("img", {alt: shows || title, width: picture.width, height: picture.height,
                               decoding: "async", src: png(small)}));
  } else {
    button.classList.add("none");
    button.append("picture file");
  }
  for (const [x, y] of touches || []) {
    button.append(make("span", {className: "touch", "aria-hidden": "true",
        style: `left:${100 * x / session.screen[0]}%;top:${100 * y / session.screen[1]}%`}));
  }
  const place = plates.push(plate) - 1;
  plate.button = button;
  button.addEventListener("click", () => enlarge(place));
  return button;
}

let enlarged = 0;

function enlarge(place) {
  enlarged = place;
  const {picture, title, shows} = plates[place];
  const source = picture.full || picture.thumb;
  byId("viewer-picture").alt = shows || title;
  if (source) byId("viewer-picture").src = png(source);
  else byId("viewer-picture").removeAttribute("src");
  // A thumbnail that stands in for its picture takes as much room as the picture would.
  byId("viewer-picture").style.height = picture.full ? "" : "100%";
  byId("viewer-title").textContent = title;
  byId("viewer-note").textContent = shows || "";
  byId("viewer-note").hidden = !shows;
  byId("viewer-file").hidden = !picture.file;
  if (picture.file) byId("viewer-file").href = linkTo(picture.file);
  byId("viewer-back").disabled = place === 0;
  byId("viewer-next").disabled = place === plates.length - 1;
  if (!byId("viewer").open) byId("viewer").showModal();
}

function walk(by) {
  const place = Math.min(Math.max(enlarged + by, 0), plates.length - 1);
  if (place !== enlarged) enlarge(place);
}

function wireViewer() {
  const viewer = byId("viewer");
  const keys = {ArrowLeft: -1, ArrowUp: -1, ArrowRight: 1, ArrowDown: 1,
                Home: -Infinity, End: Infinity};
  viewer.addEventListener("keydown", (event) => {
    if (!(event.key in keys)) return;
    event.preventDefault();
    walk(keys[event.key]);
  });
  viewer.addEventListener("click", (event) => { if (event.target === viewer) viewer.close(); });
  viewer.addEventListener("close", () => plates[enlarged].button.focus());
  byId("viewer-back").addEventListener("click", () => walk(-1));
  byId("viewer-next").addEventListener("click", () => walk(1));
  byId("viewer-close").addEventListener("click", () => viewer.close());
}

// What happened.

const kindWords = {event: "input", check: "expected", debug: "log"};

function wordOf(entry) {
  if (entry.kind === "check" && !entry.passed) return "failed";
  if (entry.kind === "log" && entry.weight) return entry.weight === "failure" ? "error" : "warning";
  return kindWords[entry.kind] || entry.kind;
}

// A step's line of the trace stands once, not beside each of its events.
function said(entry, where) {
  const text = make("span", {className: "text"}, entry.text);
  if (entry.motions > 1) text.append(` (${entry.motions} movements)`);
  return make("div", {className: "said"}, text,
      where ? make("span", {className: "where"}, where) : null,
      entry.why ? make("span", {className: "why"}, entry.why) : null);
}

function listOf(entries) {
  const list = make("ol", {className: "entries"});
  let before = "";
  for (const entry of entries) {
    list.append(make("li", {className: entry.kind + " " + (entry.weight || "")},
        make("time", {}, seconds(entry.time)), make("span", {className: "kind"}, wordOf(entry)),
        said(entry, entry.where === before && entry.kind === "event" ? "" : entry.where)));
    before = entry.where || before;
  }
  return list;
}

// Frames: one with entries that are wanted is a card; those without stand side by side.

const hidden = new Set(["debug"]);
const wanted = (entries) => entries.filter((entry) => entry.weight === "failure" || !hidden.has(entry.kind));
const hasFailed = (entries) => entries.some((entry) => (entry.kind === "error" || entry.kind === "check") && entry.weight === "failure");
const touchesOf = (entries) => entries.filter((entry) => entry.touch).map((entry) => entry.touch);

function card(frame, entries, passed) {
  const title = "Frame " + frame.number;
  const meta = [plural(frame.items, "item"), `painted in ${frame.paint.toFixed(1)} ms`];
  if (passed > 0) meta.unshift(`${seconds(passed)} after the one before`);
  return make("article", {className: "card" + (hasFailed(entries) ? " marked" : ""),
                          id: "frame-" + frame.index, tabIndex: -1, "aria-label": title},
      make("div", {}, thumbnail(frame.picture, title, frame.shows, touchesOf(frame.entries))),
      make("div", {},
          make("header", {}, make("h3", {}, title), make("span", {className: "meta"}, seconds(frame.time))),
          make("p", {className: "meta"}, meta.join(" · "), " · ", make("span", {className: "hash"}, frame.hash)),
          listOf(entries)));
}

function quiet(frame) {
  const title = "Frame " + frame.number;
  return make("figure", {id: "frame-" + frame.index, tabIndex: -1},
      thumbnail(frame.picture, title, frame.shows),
      make("figcaption", {}, title, make("br"), seconds(frame.time)));
}

function showFrames() {
  const list = byId("frame-list");
  list.replaceChildren();
  plates.length = fixedPlates;
  const before = wanted(session.before);
  if (before.length > 0) {
    list.append(make("article", {className: "card bare" + (hasFailed(before) ? " marked" : "")},
        make("div", {}, make("h3", {}, "Before the first frame"), listOf(before))));
  }
  let strip = null;
  let last = null;
  for (const frame of session.frames) {
    const leftOut = last === null ? 0 : frame.index - last.index - 1;
    if (leftOut > 0) list.append(make("p", {className: "meta"}, plural(leftOut, "frame") + " left out here"));
    const entries = wanted(frame.entries);
    if (leftOut > 0 || entries.length > 0) strip = null;
    if (entries.length > 0) {
      list.append(card(frame, entries, last === null ? 0 : frame.time - last.time));
    } else {
      if (strip === null) list.append(strip = make("div", {className: "strip"}));
      strip.append(quiet(frame));
    }
    last = frame;
  }
  if (session.frames.length === 0 && before.length === 0) {
    list.append(make("p", {className: "meta"}, "There are none."));
  }
}

function showFilters() {
  const used = new Set([session.before, ...session.frames.map((frame) => frame.entries)].flat().map((one) => one.kind));
  const choices = [["step", "Steps"], ["event", "Input"], ["check", "Expectations"], ["log", "Log"], ["debug", "Debug log"],
                   ["world", "World"], ["shot", "Shots"]];
  for (const [kind, label] of choices) {
    if (!used.has(kind)) continue;
    const box = make("input", {type: "checkbox", checked: !hidden.has(kind)});
    box.addEventListener("change", () => {
      if (box.checked) hidden.delete(kind);
      else hidden.add(kind);
      showFrames();
    });
    byId("filters").append(make("label", {}, box, label));
  }
}

function showFailures() {
  byId("failures").hidden = session.failures.length === 0;
  const shown = new Set(session.frames.map((frame) => frame.index));
  for (const failure of session.failures) {
    const item = make("div", {}, make("h3", {}, failure.text),
        failure.why ? make("p", {className: "why"}, failure.why) : null);
    const at = make("p", {className: "meta"}, seconds(failure.time), failure.where ? " · " : "",
        failure.where ? make("span", {className: "where"}, failure.where) : null);
    if (shown.has(failure.frame)) {
      at.append(" · ", make("a", {href: "#frame-" + failure.frame}, "go to its frame"));
    }
    item.append(at);
    const picture = failure.picture === undefined ? null
        : make("div", {className: "small"}, thumbnail(failure.picture, "The screen at the failure"));
    byId("failure-list").append(make("li", {}, picture, item));
  }
}

// The timeline.

function showTimeline() {
  const length = Math.max(session.duration, 1);
  const ticks = (times) => [...new Set(times.map((time) => Math.round(time / length * 10000) / 10))]
      .map((x) => `M${x} 2V18`).join("");
  const lane = (name, marks) => {
    const svg = document.createElementNS("http://www.w3.org/2000/svg", "svg");
    svg.setAttribute("viewBox", "0 0 1000 20");
    svg.setAttribute("preserveAspectRatio", "none");
    for (const [kind, line] of [["track", "M0 10H1000"], ...marks]) {
      const path = document.createElementNS("http://www.w3.org/2000/svg", "path");
      path.setAttribute("class", kind);
      path.setAttribute("d", line);
      svg.append(path);
    }
    byId("timeline").append(make("div", {className: "lane"}, make("span", {}, name), svg));
  };
  const {frames, input, passed, failed} = session.times;
  lane("Frames", [["frame", ticks(frames)]]);
  lane("Input", [["input", ticks(input)]]);
  lane("Checks", [["passed", ticks(passed)], ["failed", ticks(failed)]]);
  byId("timeline").setAttribute("aria-label", `${plural(frames.length, "frame")}, ` +
      `${plural(input.length, "input event")}, ${plural(passed.length, "passed expectation")} and ` +
      `${plural(failed.length, "failure")} in ${seconds(session.duration)}`);
  for (const part of [0, 0.25, 0.5, 0.75, 1]) {
    byId("axis").append(make("span", {}, (length * part / 1000).toFixed(1) + " s"));
  }
  byId("timeline").addEventListener("click", (event) => {
    const track = byId("timeline").querySelector("svg").getBoundingClientRect();
    const time = (event.clientX - track.left) / track.width * length;
    const before = session.frames.filter((frame) => frame.time <= time).pop() || session.frames[0];
    if (before) byId("frame-" + before.index).scrollIntoView({block: "center"});
  });
}

// The comparison with another run.

function side(name, frame) {
  if (!frame) return make("figure", {}, make("div", {className: "thumb none"}, "no such frame"), make("figcaption", {}, name));
  const title = `${name}: frame ${frame.number}`;
  return make("figure", {}, thumbnail(frame.picture, title, frame.shows),
      make("figcaption", {}, title, make("br"), seconds(frame.time)));
}

function pairTitle(pair) {
  if (pair.kind === "moved") return `Frame ${pair.here.number}: ${seconds(pair.here.time)} here, ${seconds(pair.there.time)} there`;
  if (pair.kind === "only here") return `Frame ${pair.here.number} is in this run only`;
  if (pair.kind === "only there") return `Frame ${pair.there.number} is in the other run only`;
  const verb = pair.pixels === 1 ? " differs" : " differ";
  return `Frame ${pair.here.number}: ` + (pair.pixels > 0 ? plural(pair.pixels, "pixel") + verb
      : "its items differ, its picture does not");
}

function showComparison() {
  const comparison = session.comparison;
  byId("comparison").hidden = !comparison;
  if (!comparison) return;
  const {differences, frames, pairs} = comparison;
  byId("comparison-summary").textContent = differences === 0
      ? `Frames and pictures are the same as in ${comparison.with}.`
      : `${differences} of ${plural(frames, "frame")} ${differences === 1 ? "differs" : "differ"}` +
        ` from what is in ${comparison.with}.` +
        (differences > pairs.length ? ` The first ${pairs.length} are shown.` : "");
  for (const pair of pairs) {
    const sides = make("div", {className: "sides"}, side("This run", pair.here), side("The other run", pair.there));
    if (pair.picture !== undefined) {
      sides.append(make("figure", {}, thumbnail(pair.picture, "Difference"),
          make("figcaption", {}, "What differs")));
    }
    byId("pairs").append(make("article", {className: "pair"}, make("h3", {}, pairTitle(pair)),
        pair.kind === "moved" ? "" : sides));
  }
}

showVerdict();
showFailures();
showTimeline();
showComparison();
fixedPlates = plates.length;
showFrames();
showFilters();
wireViewer();
