// Drives a headless Chromium through its debugging protocol, over a pipe: no port, no package.
import { spawn } from "node:child_process";
import { mkdtempSync, rmSync } from "node:fs";
import { tmpdir } from "node:os";
import { join } from "node:path";

export class Chromium {
    static async start(program = process.env.QRX_CHROMIUM ?? "chromium") {
        const folder = mkdtempSync(join(tmpdir(), "qrx_page_"));
        const child = spawn(
            program,
            [
                "--headless=new", "--no-sandbox", "--use-angle=swiftshader", "--enable-unsafe-swiftshader",
                "--remote-debugging-pipe", `--user-data-dir=${folder}`, "--no-first-run", "--disable-extensions",
                "--disable-background-networking", "--disable-component-update", "--disable-sync", "--no-default-browser-check",
                "--disable-dev-shm-usage", "--font-render-hinting=none", "--force-color-profile=srgb", "--hide-scrollbars",
                "--force-device-scale-factor=1", "about:blank",
            ],
            { stdio: ["ignore", "ignore", "pipe", "pipe", "pipe"] },
        );
        return new Chromium(child, folder);
    }

    constructor(child, folder) {
        this.child = child;
        this.folder = folder;
        this.waiting = new Map();
        this.listeners = [];
        this.next = 0;
        this.errors = "";
        child.stderr.on("data", (text) => (this.errors += text));
        let rest = "";
        child.stdio[4].setEncoding("utf8");
        child.stdio[4].on("data", (text) => {
            const messages = (rest + text).split("\0");
            rest = messages.pop() ?? "";
            for (const message of messages) this.receive(JSON.parse(message));
        });
        child.on("exit", () => {
            for (const { reject } of this.waiting.values()) reject(new Error(`Chromium ended: ${this.errors.slice(-2000)}`));
        });
    }

    receive(message) {
        const call = this.waiting.get(message.id);
        if (call !== undefined) {
            this.waiting.delete(message.id);
            if (message.error) call.reject(new Error(`${call.method}: ${message.error.message}`));
            else call.resolve(message.result);
            return;
        }
        for (const listener of this.listeners) listener(message);
    }

    send(method, params = {}, sessionId = undefined) {
        const id = ++this.next;
        this.child.stdio[3].write(JSON.stringify({ id, method, params, sessionId }) + "\0");
        return new Promise((resolve, reject) => this.waiting.set(id, { resolve, reject, method }));
    }

    async newPage(width = 1200, height = 800) {
        const { targetId } = await this.send("Target.createTarget", { url: "about:blank" });
        const { sessionId } = await this.send("Target.attachToTarget", { targetId, flatten: true });
        const page = new Tab(this, sessionId, targetId);
        await page.prepare(width, height);
        return page;
    }

    async stop() {
        const ended = new Promise((done) => this.child.on("exit", done));
        await this.send("Browser.close").catch(() => this.child.kill());
        await ended;
        rmSync(this.folder, { recursive: true, force: true, maxRetries: 5 });
    }
}

class Tab {
    constructor(browser, session, target) {
        this.browser = browser;
        this.session = session;
        this.target = target;
        this.said = [];
        this.requests = [];
        this.waiters = [];
        browser.listeners.push((message) => {
            if (message.sessionId === session) this.hear(message);
        });
    }

    hear({ method, params }) {
        if (method === "Runtime.consoleAPICalled") this.said.push(params.args.map((a) => a.value ?? a.description).join(" "));
        if (method === "Runtime.exceptionThrown") this.said.push(params.exceptionDetails.exception?.description ?? params.exceptionDetails.text);
        if (method === "Log.entryAdded") this.said.push(params.entry.text);
        if (method === "Network.requestWillBeSent") this.requests.push(params.request.url.slice(0, 200));
        this.waiters = this.waiters.filter((waiter) => !waiter(method, params));
    }

    send(method, params) {
        return this.browser.send(method, params, this.session);
    }

    async prepare(width, height) {
        for (const domain of ["Page", "Runtime", "Log", "Network", "Performance"]) await this.send(`${domain}.enable`);
        await this.resize(width, height);
    }

    async resize(width, height) {
        await this.send("Emulation.setDeviceMetricsOverride", { width, height, deviceScaleFactor: 1, mobile: false });
    }

    /** Opens an address afresh and waits until the page is ready; gives the milliseconds that took. */
    async open(url, pause = 50) {
        this.said = [];
        this.requests = [];
        await this.send("Page.navigate", { url: "about:blank" });
        const begin = performance.now();
        await this.send("Page.navigate", { url });
        await this.until("document.documentElement?.dataset.ready === 'yes'", 30, pause);
        await this.frame();
        return performance.now() - begin;
    }

    async until(expression, seconds = 30, pause = 50) {
        const end = Date.now() + seconds * 1000;
        while (!(await this.value(expression).catch(() => false))) {
            if (Date.now() > end) throw new Error(`${expression} didn't come true; the page said: ${this.said.join("; ")}`);
            await new Promise((done) => setTimeout(done, pause));
        }
    }

    async value(expression) {
        const { result, exceptionDetails } = await this.send("Runtime.evaluate", {
            expression, awaitPromise: true, returnByValue: true, userGesture: true,
        });
        if (exceptionDetails) throw new Error(exceptionDetails.exception?.description ?? exceptionDetails.text);
        return result.value;
    }

    /** Waits for what was asked for to be drawn. */
    frame() {
        return this.value("new Promise((done) => requestAnimationFrame(() => requestAnimationFrame(() => done(true))))");
    }

    async click(x, y) {
        for (const type of ["mousePressed", "mouseReleased"]) {
            await this.send("Input.dispatchMouseEvent", { type, x, y, button: "left", clickCount: 1 });
        }
        await this.frame();
    }

    async press(key, code = key, modifiers = 0) {
        const text = key.length === 1 ? key : undefined;
        await this.send("Input.dispatchKeyEvent", { type: text ? "keyDown" : "rawKeyDown", key, code, text, modifiers, windowsVirtualKeyCode: key === "Tab" ? 9 : key === "Enter" ? 13 : 0 });
        await this.send("Input.dispatchKeyEvent", { type: "keyUp", key, code, modifiers });
        await this.frame();
    }

    /** A PNG of the window, or of an element of the page. */
    async picture(selector = undefined) {
        const clip = selector && (await this.value(`(() => { const r = document.querySelector(${JSON.stringify(selector)}).getBoundingClientRect();
            return { x: r.x, y: r.y, width: r.width, height: r.height, scale: 1 }; })()`));
        const { data } = await this.send("Page.captureScreenshot", { format: "png", ...(clip ? { clip } : {}) });
        return Buffer.from(data, "base64");
    }

    async close() {
        await this.browser.send("Target.closeTarget", { targetId: this.target });
    }
}
