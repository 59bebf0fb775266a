// The page's controls and lists, and what they do.
import { Box3, Vector3 } from "three";
import { type Address, formatAddress, parseAddress } from "./address";
import { Body, type ColourBy, type Hit } from "./body";
import { fillCard } from "./card";
import { at, type Model, type ModelObject, type Region } from "./data";
import { button, element, make, swatch } from "./dom";
import { kindColours, Marks, profileLines } from "./marks";
import { Overlay } from "./overlay";
import { Stage, views } from "./stage";
import { briefText, counted, kindHeading, kindOrder, kindWord, shortened } from "./text";

/** What is selected: an object of the model, a set, an instance. */
export type Selection =
    | { kind: "object"; index: number }
    | { kind: "set"; region: Region }
    | { kind: "instance"; index: number; hit?: Hit };

export class Page {
    private readonly stage: Stage | undefined;
    readonly body: Body | undefined;
    readonly marks: Marks | undefined;
    private readonly overlay: Overlay | undefined;
    step = 0;
    selection: Selection | undefined;
    private colourBy: ColourBy = "instance";
    private cut = { axis: "" as "x" | "y" | "z" | "", part: 0.5, flipped: false };
    private remembering = 0;

    constructor(readonly model: Model) {
        const { header } = model;
        element("title").textContent = header.title;
        this.stage = this.makeStage();
        if (this.stage !== undefined && header.instances.length > 0) {
            this.body = new Body(model, this.stage);
            this.marks = new Marks(model, this.body, this.stage);
            this.marks.changed = () => this.fillLabels();
            this.overlay = new Overlay(this.stage);
        }
        this.fillFacts();
        this.fillInstances();
        this.fillSets();
        this.fillSteps();
        this.connectTools();
        this.connectCanvas();
        // The last step tells most: what holds at the end of the analysis.
        this.step = Math.min(1, header.steps.length - 1);
        this.setColour("instance");
        this.marks?.show(this.step);
        this.stage?.fit(undefined, new Vector3(...at(views, 0).eye), new Vector3(0, 0, 1));
        this.follow(parseAddress(location.hash));
        window.addEventListener("hashchange", () => this.follow(parseAddress(location.hash)));
        if (header.instances.every((_, i) => model.meshOf(i).elements === 0 && model.meshOf(i).nodes === 0)) {
            this.say("This model has no mesh to show.");
        }
        document.documentElement.dataset["ready"] = "yes";
    }

    private makeStage(): Stage | undefined {
        try {
            return new Stage(element<HTMLCanvasElement>("canvas"), () => this.remember());
        } catch {
            this.say("This browser can't draw in three dimensions (WebGL is missing or switched off). The lists work all the same.");
            return undefined;
        }
    }

    private say(text: string): void {
        const note = element("note");
        note.textContent = text;
        note.hidden = false;
    }

    private announce(text: string): void {
        element("live").textContent = text;
    }

    // What the address keeps.

    private address(): Address {
        const { header } = this.model;
        const address: Address = {};
        const step = header.steps[this.step];
        if (step !== undefined) address.step = step.name;
        if (this.selection !== undefined) address.select = this.selectionText(this.selection);
        if (this.colourBy !== "instance") address.colour = this.colourBy;
        if (this.cut.axis !== "") address.cut = [this.cut.axis, this.cut.part, this.cut.flipped ? 1 : 0].join(",");
        if (this.stage !== undefined) address.view = this.stage.view;
        return address;
    }

    private selectionText(selection: Selection): string {
        switch (selection.kind) {
            case "object": {
                const object = at(this.model.header.objects, selection.index);
                return `${object.kind}/${object.name}`;
            }
            case "set":
                return `set/${selection.region.instance < 0 ? "" : this.model.instance(selection.region.instance).name}/${this.model.setOf(selection.region)?.name ?? ""}`;
            case "instance":
                return `instance/${this.model.instance(selection.index).name}`;
        }
    }

    private findSelection(text: string): Selection | undefined {
        const { header } = this.model;
        const object = header.objects.findIndex((candidate) => `${candidate.kind}/${candidate.name}` === text);
        if (object >= 0) return { kind: "object", index: object };
        for (let index = 0; index < header.instances.length; ++index) {
            const instance: Selection = { kind: "instance", index };
            if (this.selectionText(instance) === text) return instance;
        }
        if (text.startsWith("set/")) {
            for (const region of this.model.regions()) {
                const set: Selection = { kind: "set", region };
                if (this.selectionText(set) === text) return set;
            }
        }
        return undefined;
    }

    private remember(): void {
        window.clearTimeout(this.remembering);
        this.remembering = window.setTimeout(() => {
            const fragment = formatAddress(this.address());
            if (fragment !== location.hash) history.replaceState(null, "", fragment);
        }, 200);
    }

    private follow(address: Address): void {
        const { header } = this.model;
        const step = header.steps.findIndex((candidate) => candidate.name === address.step);
        if (address.colour === "section" || address.colour === "material" || address.colour === "type") {
            this.setColour(address.colour);
        }
        if (address.cut !== undefined) {
            const [axis, part, flipped] = address.cut.split(",");
            if (axis === "x" || axis === "y" || axis === "z") this.setCut({ axis, part: Number(part) || 0, flipped: flipped === "1" });
        }
        this.goToStep(step >= 0 ? step : this.step);
        this.select(address.select === undefined ? undefined : this.findSelection(address.select), false);
        if (address.view !== undefined && this.stage !== undefined) this.stage.view = address.view;
        this.setPressed("projection", this.stage?.parallelView ?? false);
    }

    // Lists.

    private fillFacts(): void {
        const { header } = this.model;
        const facts = element("facts");
        const add = (term: string, text: string) => facts.append(make("dt", {}, term), make("dd", {}, text));
        if (header.description !== "") add("Model", header.description);
        const nodes = header.instances.reduce((sum, _, i) => sum + this.model.meshOf(i).nodes, 0);
        const elements = header.instances.reduce((sum, _, i) => sum + this.model.meshOf(i).elements, 0);
        add("Mesh", `${counted(nodes, "node")}, ${counted(elements, "element")}`);
        const unknown = new Map<string, number>();
        header.instances.forEach((_, i) => {
            for (const [type, count] of Object.entries(this.model.meshOf(i).unknown)) unknown.set(type, (unknown.get(type) ?? 0) + count);
        });
        for (const [type, count] of unknown) add("Unknown", `${counted(count, "element")} of type ${type}, drawn as points`);
        if (this.stage !== undefined && this.body !== undefined) {
            const size = this.stage.box.getSize(new Vector3());
            add("Size", size.toArray().map((x) => Number(x.toPrecision(4))).join(" × "));
        }
        add("Shells", "the negative side is brown");
    }

    private fillInstances(): void {
        const list = element("instances");
        this.model.header.instances.forEach((instance, index) => {
            const shown = make("input", { type: "checkbox", "aria-label": `Show ${instance.name}` });
            shown.checked = true;
            shown.addEventListener("change", () => this.body?.showInstance(index, shown.checked));
            const note = instance.kind === "instance" ? `of ${instance.part}` : instance.kind;
            const choose = button(instance.name, false, () => this.select({ kind: "instance", index }), " ", make("small", {}, note));
            list.append(make("li", { "data-select": `instance/${instance.name}` }, shown, choose));
        });
    }

    private fillSets(): void {
        const list = element("sets");
        for (const region of this.model.regions()) {
            const set = this.model.setOf(region);
            if (set === undefined) continue;
            const name = this.model.nameOf(region);
            const noun = { node: "node", element: "element", surface: "face" }[set.kind];
            const choose = button(name, false, () => this.select({ kind: "set", region }), " ", make("small", {}, counted(set.count, noun)));
            const item = make("li", { "data-select": this.selectionText({ kind: "set", region }), "data-name": name.toLowerCase() }, choose);
            if (set.internal) item.dataset["internal"] = "yes";
            list.append(item);
        }
        const search = element<HTMLInputElement>("search");
        const internal = element<HTMLInputElement>("internal");
        const filter = () => {
            const wanted = search.value.trim().toLowerCase();
            for (const item of list.querySelectorAll<HTMLLIElement>("li")) {
                const named = (item.dataset["name"] ?? "").includes(wanted);
                item.hidden = !named || (item.dataset["internal"] === "yes" && !internal.checked);
            }
            this.fillHappening();
        };
        search.addEventListener("input", filter);
        internal.addEventListener("change", filter);
        filter();
    }

    private fillSteps(): void {
        const list = element("steps");
        this.model.header.steps.forEach((step, index) => {
            const choose = button(step.name, undefined, () => this.goToStep(index), make("small", {}, step.procedure));
            if (step.description !== "") choose.title = step.description;
            list.append(make("li", {}, choose));
        });
        element("time").hidden = this.model.header.steps.length === 0;
    }

    private fillHappening(): void {
        const place = element("happening");
        place.replaceChildren();
        const { header } = this.model;
        const step = header.steps[this.step];
        if (step === undefined) {
            place.append(make("p", { class: "soft" }, "There are no steps here. A click on the picture, on an instance or on a set tells of it."));
            return;
        }
        place.append(make("h2", {}, `Step ${step.name}`));
        const facts = [step.procedure, step.perturbation ? "linear perturbation" : "", step.period === undefined ? "" : `time ${step.period}`, step.description];
        place.append(make("p", { class: "soft" }, facts.filter((fact) => fact !== "").join(" · ")));
        if (step.lines !== undefined) place.append(make("pre", { class: "lines", tabindex: "0", "aria-label": "The step's lines of the deck" }, step.lines));
        if (step.loadCases.length > 0) place.append(make("p", { class: "soft" }, `Load cases: ${step.loadCases.join(", ")}`));
        const wanted = element<HTMLInputElement>("search").value.trim().toLowerCase();
        const resting: HTMLLIElement[] = [];
        for (const kind of kindOrder) {
            const items: HTMLLIElement[] = [];
            header.objects.forEach((object, index) => {
                if (object.kind !== kind || !object.name.toLowerCase().includes(wanted)) return;
                const active = this.model.isActive(object, this.step);
                const item = this.objectItem(index, active);
                (active ? items : resting).push(item);
            });
            if (items.length === 0) continue;
            const shown = make("input", { type: "checkbox", "aria-label": `Draw ${kindHeading(kind).toLowerCase()}` });
            shown.checked = !(this.marks?.isHidden(kind) ?? false);
            shown.addEventListener("change", () => this.marks?.hideKind(kind, !shown.checked));
            place.append(make("h3", {}, shown, " ", swatch(kindColours[kind] ?? "gray"), kindHeading(kind)), make("ul", { class: "list" }, ...items));
        }
        if (resting.length > 0) {
            const details = make("details", {}, make("summary", {}, `Not in force in this step (${resting.length})`), make("ul", { class: "list" }, ...resting));
            place.append(details);
        }
        this.markSelection();
    }

    /** What an object's state in the step says. */
    private brief(object: ModelObject): string {
        const state = this.model.stateIn(object, this.step);
        const fields = state?.fields ?? [];
        // A bolt whose length is held keeps the force of the step before in its record.
        const isHeld = object.mark === "bolt" && state?.magnitude === 0;
        return briefText(isHeld ? fields.filter((field) => typeof field.value !== "number") : fields);
    }

    /** The names on the picture: those of loads ahead of conditions, and so on. */
    private fillLabels(): void {
        const order = ["loads", "boundaryConditions", "interactions", "constraints", "fields"];
        const labels = (this.marks?.named() ?? []).map(({ object: index, places }) => {
            const object = at(this.model.header.objects, index);
            const note = this.model.isBuiltIn(object, this.step) ? this.model.statusWords(object, this.step) : this.brief(object);
            const text = shortened(note === "" ? object.name : `${object.name}: ${note}`);
            return { object: index, text, colour: kindColours[object.kind] ?? "gray", places };
        });
        const rank = (label: { object: number }) => order.indexOf(at(this.model.header.objects, label.object).kind);
        labels.sort((a, b) => rank(a) - rank(b));
        this.overlay?.setLabels(labels, this.selection?.kind === "object" ? this.selection.index : -1);
    }

    private objectItem(index: number, active: boolean): HTMLLIElement {
        const object = at(this.model.header.objects, index);
        const words = [object.label, this.model.statusWords(object, this.step), active ? this.brief(object) : ""];
        const choose = button(object.name, false, () => this.select({ kind: "object", index }), " ", make("small", {}, words.filter((word) => word !== "").join(" · ")));
        if (!active) choose.classList.add("inactive");
        return make("li", { "data-select": `${object.kind}/${object.name}` }, choose);
    }

    private fillLegend(): void {
        const list = element("legend");
        list.replaceChildren();
        for (const { name, colour } of this.body?.legend ?? []) {
            const none = this.colourBy === "material" ? "no material" : "no section";
            list.append(make("li", {}, swatch(colour), name === "" ? none : name));
        }
    }

    private markSelection(): void {
        const chosen = this.selection === undefined ? undefined : this.selectionText(this.selection);
        for (const item of document.querySelectorAll<HTMLElement>("[data-select]")) {
            item.querySelector("button")?.setAttribute("aria-pressed", String(item.dataset["select"] === chosen));
        }
    }

    // What can be asked for.

    goToStep(index: number): void {
        if (this.model.header.steps[index] === undefined) {
            this.fillHappening();
            return;
        }
        this.step = index;
        element("steps").querySelectorAll("button").forEach((choose, i) => {
            if (i === index) choose.setAttribute("aria-current", "step");
            else choose.removeAttribute("aria-current");
        });
        this.marks?.show(index);
        this.fillHappening();
        this.fillCard();
        this.announce(`Step ${at(this.model.header.steps, index).name}`);
        this.remember();
    }

    select(selection: Selection | undefined, zoom = true): void {
        this.selection = selection;
        let box = new Box3();
        if (selection === undefined) this.body?.light([]);
        else if (selection.kind === "set") box = this.body?.light([selection.region]) ?? box;
        else if (selection.kind === "instance") box = this.body?.light([], selection.hit === undefined ? [selection.index] : []) ?? box;
        else box = this.body?.light(at(this.model.header.objects, selection.index).regions) ?? box;
        if (zoom && selection?.kind === "set" && !box.isEmpty()) this.zoomToSelection();
        this.fillLabels();
        this.markSelection();
        this.fillCard();
        if (selection !== undefined) this.announce(`Selected ${this.selectionText(selection).split("/").slice(1).join(" ")}`);
        this.remember();
    }

    zoomToSelection(): void {
        const { selection } = this;
        if (selection === undefined || this.body === undefined) return;
        const box = new Box3();
        if (selection.kind === "instance") box.copy(at(this.body.instances, selection.index).box);
        const regions = selection.kind === "set" ? [selection.region] : selection.kind === "object" ? at(this.model.header.objects, selection.index).regions : [];
        for (const region of regions) for (const part of this.model.partsOf(region)) box.union(this.body.boxOf(part));
        // With some of what is around it.
        this.stage?.fit(box.isEmpty() ? undefined : box.expandByScalar(0.04 * this.stage.size));
    }

    private fillCard(): void {
        fillCard(element("card"), this);
    }

    kindOf(selection: Selection): string {
        if (selection.kind === "object") return kindWord(at(this.model.header.objects, selection.index).kind);
        return selection.kind;
    }

    setColour(by: ColourBy): void {
        this.colourBy = by;
        element<HTMLSelectElement>("colour").value = by;
        this.body?.colour(by);
        this.fillLegend();
        this.remember();
    }

    setCut(cut: { axis: "x" | "y" | "z" | ""; part: number; flipped: boolean }): void {
        this.cut = cut;
        element<HTMLSelectElement>("cut-axis").value = cut.axis;
        const place = element<HTMLInputElement>("cut-place");
        const side = element<HTMLButtonElement>("cut-side");
        place.value = String(Math.round(cut.part * 1000));
        place.disabled = cut.axis === "";
        side.disabled = cut.axis === "";
        this.setPressed("cut-side", cut.flipped);
        this.stage?.cut(cut.axis, cut.part, cut.flipped);
        this.remember();
    }

    private setPressed(id: string, pressed: boolean): void {
        element(id).setAttribute("aria-pressed", String(pressed));
    }

    // Controls.

    private connectTools(): void {
        const press = (id: string, action: (on: boolean) => void) => {
            element(id).addEventListener("click", () => {
                const on = element(id).getAttribute("aria-pressed") !== "true";
                this.setPressed(id, on);
                action(on);
            });
        };
        element("fit").addEventListener("click", () => this.stage?.fit());
        for (const view of views) {
            const choose = button(view.name, undefined, () => this.look(view));
            choose.title = `Look ${view.label}`;
            choose.setAttribute("aria-label", `Look ${view.label}`);
            element("views").append(choose);
        }
        press("projection", (on) => this.stage?.setParallel(on));
        press("element-edges", (on) => this.body?.showMesh(on));
        press("names", (on) => this.overlay?.showNames(on));
        press("orientations", (on) => this.marks?.showTriads(on));
        const profiles = this.body === undefined ? undefined : profileLines(this.model, this.body);
        if (profiles !== undefined) this.stage?.scene.add(profiles);
        element("profiles").hidden = profiles === undefined;
        press("profiles", (on) => {
            if (profiles !== undefined) profiles.visible = on;
            this.stage?.draw();
        });
        element("orientations").hidden = this.model.header.instances.every((instance) => (instance.orientations ?? []).length === 0);
        const colour = element<HTMLSelectElement>("colour");
        colour.addEventListener("change", () => this.setColour(colour.value as ColourBy));
        const axis = element<HTMLSelectElement>("cut-axis");
        axis.addEventListener("change", () => this.setCut({ ...this.cut, axis: axis.value as "x" | "y" | "z" | "" }));
        const place = element<HTMLInputElement>("cut-place");
        place.addEventListener("input", () => this.setCut({ ...this.cut, part: Number(place.value) / 1000 }));
        press("cut-side", (on) => this.setCut({ ...this.cut, flipped: on }));
        element("picture").addEventListener("click", () => void this.savePicture());
    }

    private look(view: (typeof views)[number]): void {
        this.stage?.fit(undefined, new Vector3(...view.eye), new Vector3(...view.up));
    }

    private async savePicture(): Promise<void> {
        const blob = await this.stage?.picture();
        if (!blob) return;
        const link = make("a", { download: `${this.model.header.title}.png`, href: URL.createObjectURL(blob) });
        link.click();
        URL.revokeObjectURL(link.href);
    }

    private connectCanvas(): void {
        const canvas = element<HTMLCanvasElement>("canvas");
        let down: { x: number; y: number } | undefined;
        canvas.addEventListener("pointerdown", (event) => (down = { x: event.offsetX, y: event.offsetY }));
        canvas.addEventListener("pointerup", (event) => {
            if (down === undefined || Math.hypot(event.offsetX - down.x, event.offsetY - down.y) > 4) return;
            this.pickAt(event.offsetX, event.offsetY);
        });
        canvas.addEventListener("keydown", (event) => {
            if (event.ctrlKey || event.metaKey || event.altKey || !this.key(event.key, event.shiftKey)) return;
            event.preventDefault();
        });
    }

    /** Selects what lies under a point of the canvas: a mark, else an instance. */
    pickAt(x: number, y: number): void {
        const object = this.overlay?.objectAt(x, y) ?? this.marks?.pick(x, y);
        if (object !== undefined) return this.select({ kind: "object", index: object }, false);
        const hit = this.body?.pick(x, y);
        this.select(hit === undefined ? undefined : { kind: "instance", index: hit.instance, hit }, false);
    }

    private key(key: string, shift: boolean): boolean {
        const turn = Math.PI / 24;
        const arrows: Record<string, [number, number]> = { ArrowLeft: [-1, 0], ArrowRight: [1, 0], ArrowUp: [0, 1], ArrowDown: [0, -1] };
        const arrow = arrows[key];
        if (arrow !== undefined) {
            if (shift) this.stage?.move(0.05 * arrow[0], 0.05 * arrow[1]);
            else this.stage?.turn(turn * arrow[0], turn * -arrow[1]);
            return true;
        }
        const view = /^[0-6]$/.test(key) ? views[Number(key)] : undefined;
        if (view !== undefined) {
            this.look(view);
            return true;
        }
        const actions: Record<string, () => void> = {
            "+": () => this.stage?.zoom(1.15),
            "-": () => this.stage?.zoom(1 / 1.15),
            f: () => this.stage?.fit(),
            p: () => element("projection").click(),
            e: () => element("element-edges").click(),
            n: () => element("names").click(),
            ",": () => this.goToStep(this.step - 1),
            ".": () => this.goToStep(this.step + 1),
            Escape: () => this.select(undefined),
        };
        const action = actions[key.length === 1 ? key.toLowerCase() : key];
        action?.();
        return action !== undefined;
    }
}
