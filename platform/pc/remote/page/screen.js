// The application's screen: noVNC shows it, and takes the mouse and the keys.

import {forgetFingers, watchFingers} from "./fingers.js";

const RETRY_MS = 1000;
const SHARPEST = 9;

const target = document.getElementById("screen");
const status = document.getElementById("status");
let socket = null;

function say(text) {
    status.textContent = text;
    status.hidden = text === "";
}

function connect(RFB) {
    // The password stands behind the #, which no browser sends to any server.
    const password = decodeURIComponent(location.hash.slice(1));
    let isRefused = false;
    socket = new WebSocket(location.origin.replace(/^http/, "ws") + "/viewer");
    const rfb = new RFB(target, socket, {credentials: {password}});
    rfb.background = "transparent";
    rfb.scaleViewport = true;
    rfb.qualityLevel = SHARPEST;
    rfb.addEventListener("connect", () => {
        target.classList.remove("lost");
        say("");
        rfb.focus();
    });
    rfb.addEventListener("securityfailure", () => { isRefused = true; });
    rfb.addEventListener("disconnect", () => {
        socket = null;
        forgetFingers();
        target.classList.add("lost");
        if (isRefused) {
            say("The password in this page's address is not that of the application. It is new each time " +
                "the application starts: open the address that it prints.");
        } else {
            say("The application cannot be reached. Trying again…");
            setTimeout(connect, RETRY_MS, RFB);
        }
    });
}

watchFingers(target, message => {
    if (socket && socket.readyState === WebSocket.OPEN) socket.send(message);
});
target.addEventListener("contextmenu", event => event.preventDefault());
addEventListener("hashchange", () => location.reload());

import("./novnc/core/rfb.js").then(
    ({default: RFB}) => connect(RFB),
    () => say("noVNC cannot be loaded. Where the application runs, Debian's package novnc is missing."));
