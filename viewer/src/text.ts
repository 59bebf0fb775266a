// Texts that the page makes of values.
import type { Field } from "./data";

export function numberText(value: number): string {
    if (value === 0) return "0";
    const size = Math.abs(value);
    return size >= 1e6 || size < 1e-3 ? value.toExponential(5).replace(/\.?0+e/, "e") : String(Number(value.toPrecision(7)));
}

export function valueText(value: unknown): string {
    if (value === null || value === undefined) return "–";
    if (typeof value === "number") return numberText(value);
    if (typeof value === "boolean") return value ? "yes" : "no";
    if (typeof value === "string") return value;
    if (Array.isArray(value)) {
        const nested = value.some((item) => typeof item === "object" && item !== null);
        return value.map(valueText).join(nested ? "; " : ", ");
    }
    return Object.entries(value as Record<string, unknown>)
        .filter(([, item]) => item !== null)
        .map(([name, item]) => `${name} ${valueText(item)}`)
        .join(", ");
}

/** What a state says, in few words: values that are alike stand together, "u1, u2 = 0"; amplitudes are left to the card. */
export function briefText(fields: Field[]): string {
    const names = new Map<string, string[]>();
    for (const { name, value } of fields) {
        const plain = ["number", "string"].includes(typeof value) || (Array.isArray(value) && value.length === 1);
        if (!plain || name === "amplitude") continue;
        const text = valueText(value);
        // A name that every load of its class has says nothing.
        const word = typeof value === "number" && name !== "magnitude" ? name : "";
        names.set(text, [...(names.get(text) ?? []), word]);
    }
    return [...names].map(([text, words]) => (words.every((word) => word === "") ? text : `${words.join(", ")} = ${text}`)).join(", ");
}

export function shortened(text: string, most = 44): string {
    return text.length <= most ? text : `${text.slice(0, most - 1)}…`;
}

/** A count with its noun: "1 node", "1,200 nodes". */
export function counted(count: number, noun: string): string {
    return `${count.toLocaleString("en-US")} ${noun}${count === 1 ? "" : "s"}`;
}

const kinds: Record<string, [string, string]> = {
    boundaryConditions: ["boundary condition", "Boundary conditions"],
    loads: ["load", "Loads"],
    fields: ["field", "Fields"],
    interactions: ["interaction", "Interactions"],
    constraints: ["constraint", "Constraints"],
};

export const kindOrder = Object.keys(kinds);

export function kindWord(kind: string): string {
    return kinds[kind]?.[0] ?? kind;
}

export function kindHeading(kind: string): string {
    return kinds[kind]?.[1] ?? kind;
}
