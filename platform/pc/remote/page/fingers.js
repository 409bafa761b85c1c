// Touches become messages of fingers, which noVNC does not know: it would make a mouse of them.

const MESSAGE = 200;
const UP = 0, DOWN = 1, MOVE = 2;
const MOST = 10;

const numbers = new Map();  // from the browser's number of a touch to ours, the lowest that is free

function freeNumber() {
    const taken = new Set(numbers.values());
    for (let number = 0; number < MOST; ++number) if (!taken.has(number)) return number;
    return null;
}

// The pixel of the screen below a touch; outside, the one at the edge.
function place(canvas, touch) {
    const shown = canvas.getBoundingClientRect();
    const pixel = (offset, length, pixels) =>
        Math.min(Math.max(Math.floor(offset * pixels / length), 0), pixels - 1);
    return [pixel(touch.clientX - shown.left, shown.width, canvas.width),
            pixel(touch.clientY - shown.top, shown.height, canvas.height)];
}

function message(action, [x, y], number) {
    return new Uint8Array([MESSAGE, action, x >> 8, x & 255, y >> 8, y & 255, number, 0]);
}

function take(canvas, event, send) {
    for (const touch of event.changedTouches) {
        const at = place(canvas, touch);
        if (event.type === "touchstart") {
            const number = freeNumber();
            if (number === null) continue;
            numbers.set(touch.identifier, number);
            send(message(DOWN, at, number));
        } else if (numbers.has(touch.identifier)) {
            const number = numbers.get(touch.identifier);
            const isMove = event.type === "touchmove";
            if (!isMove) numbers.delete(touch.identifier);
            send(message(isMove ? MOVE : UP, at, number));
        }
    }
}

/// Sends what fingers do on the canvas in `target`, before anything below `target` learns of it.
export function watchFingers(target, send) {
    for (const type of ["touchstart", "touchmove", "touchend", "touchcancel"]) {
        target.addEventListener(type, event => {
            const canvas = target.querySelector("canvas");
            event.preventDefault();  // no scrolling, and no mouse events made of touches
            event.stopPropagation();
            if (canvas) take(canvas, event, send);
        }, {capture: true, passive: false});
    }
}

/// No finger is down any more.
export function forgetFingers() {
    numbers.clear();
}
