import assert from "node:assert/strict";
import { test } from "node:test";
import { formatAddress, parseAddress } from "../src/address";
import { briefText, counted, numberText, shortened, valueText } from "../src/text";

test("numbers are short and keep their size", () => {
    assert.equal(numberText(0), "0");
    assert.equal(numberText(-12.5), "-12.5");
    assert.equal(numberText(210000), "210000");
    assert.equal(numberText(1e-5), "1e-5");
    assert.equal(numberText(2.5e9), "2.5e+9");
});

test("values of all shapes", () => {
    assert.equal(valueText(null), "–");
    assert.equal(valueText(true), "yes");
    assert.equal(valueText([1, 2, 3]), "1, 2, 3");
    assert.equal(valueText([[1, 2], [3, 4]]), "1, 2; 3, 4");
    assert.equal(valueText({ a: 1, b: null, c: "x" }), "a 1, c x");
});

test("a state in few words: alike values together, amplitudes and tables left out", () => {
    const field = (name: string, value: unknown) => ({ name, value, doc: "" });
    assert.equal(briefText([field("u1", 0), field("u2", 0), field("u3", -0.05), field("amplitude", "Rise")]), "u1, u2 = 0, u3 = -0.05");
    assert.equal(briefText([field("typeName", "ENCASTRE")]), "ENCASTRE");
    assert.equal(briefText([field("values", [20])]), "20");
    assert.equal(briefText([field("amplitude", "Rise"), field("magnitude", 0.5)]), "0.5");
    assert.equal(briefText([field("table", [[1, 2], [3, 4]]), field("on", true)]), "");
});

test("long texts end in dots", () => {
    assert.equal(shortened("abcdef", 6), "abcdef");
    assert.equal(shortened("abcdefg", 6), "abcde…");
});

test("counts have their noun", () => {
    assert.equal(counted(1, "node"), "1 node");
    assert.equal(counted(14117, "node"), "14,117 nodes");
});

test("an address reads back as it was written, names with any character in them", () => {
    const address = { step: "A & B #1", select: "loads/50 % <x>", colour: "section", cut: "x,0.5,1", view: [1, 2, 3, 0, 0, 0, 0, 0, 1] };
    assert.deepEqual(parseAddress(formatAddress(address)), address);
});

test("what is no view in an address is passed over", () => {
    assert.deepEqual(parseAddress("#view=1,2,3"), {});
    assert.deepEqual(parseAddress("#view=1,2,x,0,0,0,0,0,1"), {});
    assert.deepEqual(parseAddress(""), {});
});
