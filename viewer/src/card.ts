// What is selected, in words: values, status, and the lines that it becomes in the deck.
import { at, type Field, type Region } from "./data";
import { button, make } from "./dom";
import type { Page } from "./page";
import { counted, valueText } from "./text";

function valueTable(fields: Field[]): HTMLElement | undefined {
    if (fields.length === 0) return undefined;
    const rows = fields.map((field) => make("tr", {}, make("th", { scope: "row", title: field.doc }, field.name), make("td", {}, valueText(field.value))));
    return make("table", {}, make("tbody", {}, ...rows));
}

export function fillCard(place: HTMLElement, page: Page): void {
    place.replaceChildren();
    const { selection } = page;
    place.hidden = selection === undefined;
    if (selection === undefined) return;
    const zoom = button("Zoom to it", undefined, () => page.zoomToSelection());
    const none = button("Select nothing", undefined, () => page.select(undefined));
    if (selection.kind === "object") fillObject(place, page, selection.index);
    else if (selection.kind === "set") fillSet(place, page, selection.region);
    else fillInstance(place, page, selection.index);
    place.append(make("p", { class: "soft" }, zoom, " ", none));
}

function fillObject(place: HTMLElement, page: Page, index: number): void {
    const { model } = page;
    const object = at(model.header.objects, index);
    place.append(make("h2", {}, object.name), make("p", { class: "soft", title: object.class }, `${object.label}: ${object.doc}`));
    const step = model.header.steps[page.step];
    if (step !== undefined) {
        place.append(make("p", {}, `In step ${step.name}: `, make("span", { class: "status" }, model.statusWords(object, page.step))));
    }
    const values = valueTable([...object.fields, ...(model.stateIn(object, page.step)?.fields ?? [])]);
    if (values !== undefined) place.append(make("h3", {}, "Values"), values);
    if (object.regions.length > 0) {
        const items = object.regions.map((region) =>
            make("li", {}, button(model.nameOf(region), undefined, () => page.select({ kind: "set", region }), " ", make("small", {}, region.role))),
        );
        place.append(make("h3", {}, "Where"), make("ul", { class: "list" }, ...items));
    }
    const written = model.cardOf(object, page.step);
    place.append(make("h3", {}, "In the deck"));
    if (written === undefined) {
        place.append(make("p", { class: "soft" }, "No lines of its own in this step."));
        return;
    }
    if (written.step !== page.step && object.steps[page.step]?.[0] !== -1) {
        place.append(make("p", { class: "soft" }, `Nothing in this step; it stands in step ${at(model.header.steps, written.step).name}:`));
    }
    for (const { loadCase, text } of written.card) {
        if (loadCase !== "") place.append(make("p", { class: "soft" }, `Load case ${loadCase}:`));
        place.append(make("pre", { class: "lines", tabindex: "0", "aria-label": "Lines of the deck" }, text));
    }
}

function fillSet(place: HTMLElement, page: Page, region: Region): void {
    const { model } = page;
    const set = model.setOf(region);
    if (set === undefined) return;
    const noun = { node: "node", element: "element", surface: "face" }[set.kind];
    const kind = { node: "Node set", element: "Element set", surface: "Surface" }[set.kind];
    place.append(make("h2", {}, model.nameOf(region)), make("p", { class: "soft" }, `${kind} of ${counted(set.count, noun)}${set.internal ? ", internal" : ""}`));
    const parts = model.partsOf(region);
    if (set.count > 0 && parts.every((part) => part.cells.length + part.negative.length + part.nodes.length === 0)) {
        place.append(make("p", { class: "soft" }, "All of it lies inside the body; the picture shows where."));
    }
    const users = model.header.objects.flatMap((object, index) =>
        object.regions.some((used) => used.instance === region.instance && used.set === region.set)
            ? [make("li", {}, button(object.name, undefined, () => page.select({ kind: "object", index }), " ", make("small", {}, object.label)))]
            : [],
    );
    if (users.length > 0) place.append(make("h3", {}, "Used by"), make("ul", { class: "list" }, ...users));
}

function fillInstance(place: HTMLElement, page: Page, index: number): void {
    const { model, selection } = page;
    const instance = model.instance(index);
    const mesh = model.meshOf(index);
    place.append(make("h2", {}, instance.name));
    const of = instance.kind === "instance" ? `Instance of ${instance.part}` : instance.kind === "part" ? "Part" : "Elements of the assembly";
    place.append(make("p", { class: "soft" }, `${of}: ${counted(mesh.nodes, "node")}, ${counted(mesh.elements, "element")}`));
    const hit = selection?.kind === "instance" ? selection.hit : undefined;
    if (hit === undefined) return;
    const fields: Field[] = [
        { name: "element", value: `${hit.label} (${hit.type})${hit.side === undefined ? "" : `, face S${hit.side}`}`, doc: "under the pointer" },
        { name: "nearest node", value: String(hit.node), doc: "its label" },
        { name: "place", value: hit.place.toArray().map((x) => Number(x.toPrecision(5))), doc: "under the pointer" },
    ];
    const { sections } = instance;
    const section = sections === undefined ? undefined : model.header.sections[model.numbers(sections)[hit.cell] ?? -1];
    if (section !== undefined) {
        fields.push({ name: "section", value: section.name, doc: section.doc });
        if (section.material !== "") fields.push({ name: "material", value: section.material, doc: "of the section" });
        if (section.profile !== undefined) fields.push({ name: "profile", value: section.profile, doc: "of the section" });
    }
    const table = valueTable(fields);
    if (table !== undefined) place.append(table);
}
