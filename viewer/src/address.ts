// What the address's fragment keeps, so that a link shows the same picture.

export interface Address {
    step?: string;
    select?: string;
    colour?: string;
    /** Nine numbers: the eye, what it looks at, and what is up; and a tenth, the height seen, for parallel views. */
    view?: number[];
    cut?: string;
}

export function parseAddress(fragment: string): Address {
    const values = new URLSearchParams(fragment.replace(/^#/, ""));
    const address: Address = {};
    for (const key of ["step", "select", "colour", "cut"] as const) {
        const value = values.get(key);
        if (value !== null) address[key] = value;
    }
    const view = values.get("view")?.split(",").map(Number);
    if (view !== undefined && (view.length === 9 || view.length === 10) && view.every(Number.isFinite)) address.view = view;
    return address;
}

export function formatAddress(address: Address): string {
    const values = new URLSearchParams();
    for (const key of ["step", "select", "colour", "cut"] as const) {
        const value = address[key];
        if (value !== undefined && value !== "") values.set(key, value);
    }
    if (address.view !== undefined) values.set("view", address.view.map((x) => Number(x.toPrecision(6))).join(","));
    return "#" + values.toString();
}
