import RFB from "./novnc/core/rfb.js";

const screen = document.getElementById("watch");
const again = document.getElementById("again");
const texts = {
    connecting: "Connecting to the watch …",
    connected: "The watch is here.",
    ended: "The watch has been switched off. Start it again with ./run --web.",
};
let display = null;

function show(state) {
    document.body.dataset.state = state;
    document.getElementById("state").textContent = texts[state];
    again.hidden = state !== "ended";
}

function connect() {
    show("connecting");
    const address = new URL("display", location.href);
    address.protocol = "ws:";
    display = new RFB(screen, address.href, { shared: true });
    display.scaleViewport = true;
    display.focusOnClick = true;
    display.background = "#000";
    // Scaled letters are read more easily than sharp edges are seen.
    display.qualityLevel = 9;
    display.compressionLevel = 2;
    display.addEventListener("connect", () => {
        show("connected");
        screen.querySelector("canvas").tabIndex = 0;
        display.focus({ preventScroll: true });
    });
    display.addEventListener("disconnect", () => {
        display = null;
        show("ended");
    });
}

// The watch takes every key, Tab too: there has to be one that leads out of it.
addEventListener("keydown", event => {
    if (event.key !== "F6" || !event.shiftKey || display === null)
        return;
    event.preventDefault();
    event.stopImmediatePropagation();
    if (screen.contains(document.activeElement)) {
        display.blur();
        document.querySelector("summary").focus();
    } else {
        display.focus();
    }
}, true);

again.addEventListener("click", connect);
fetch("keys.txt").then(answer => answer.text()).then(text => {
    document.getElementById("keys").textContent = text;
});
connect();
