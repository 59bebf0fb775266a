// Elements, made of text alone: no name ever becomes markup.

export function element<T extends HTMLElement>(id: string): T {
    const found = document.getElementById(id);
    if (found === null) throw new Error(`The page has no element ${id}.`);
    return found as T;
}

type Content = Node | string | undefined;

export function make<K extends keyof HTMLElementTagNameMap>(
    tag: K,
    attributes: Record<string, string> = {},
    ...content: Content[]
): HTMLElementTagNameMap[K] {
    const made = document.createElement(tag);
    for (const [name, value] of Object.entries(attributes)) made.setAttribute(name, value);
    for (const piece of content) if (piece !== undefined) made.append(piece);
    return made;
}

export function button(label: string, pressed: boolean | undefined, action: () => void, ...content: Content[]): HTMLButtonElement {
    const made = make("button", { type: "button" }, label, ...content);
    if (pressed !== undefined) made.setAttribute("aria-pressed", String(pressed));
    made.addEventListener("click", action);
    return made;
}

export function swatch(colour: string): HTMLElement {
    const made = make("span", { class: "swatch", "aria-hidden": "true" });
    made.style.background = colour;
    return made;
}
