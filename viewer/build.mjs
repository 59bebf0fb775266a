// Bundles the page into one HTML text, and that into a C++ source: node build.mjs PageText.cpp [page.html]
import { readFileSync, writeFileSync } from "node:fs";
import { dirname, join } from "node:path";
import { fileURLToPath } from "node:url";
import { build } from "esbuild";

const here = dirname(fileURLToPath(import.meta.url));

async function bundled(entry) {
    const result = await build({
        entryPoints: [join(here, "src", entry)],
        bundle: true,
        minify: true,
        write: false,
        format: "iife",
        target: "es2022",
        legalComments: "none",
        logLevel: "warning",
    });
    return result.outputFiles[0].text.trim();
}

const script = (await bundled("main.ts")).replaceAll("</script", "<\\/script");
const style = await bundled("style.css");
// Replaced by functions: "$" in a script is no pattern.
const page = readFileSync(join(here, "src", "page.html"), "utf8")
    .replace("@STYLE@", () => style)
    .replace("@SCRIPT@", () => script);

const pieces = [];
const bytes = Buffer.from(page);
for (let i = 0; i < bytes.length; i += 8000) pieces.push(bytes.subarray(i, i + 8000).toString("latin1"));
const literals = pieces.map((piece) => {
    const text = [...piece].map((c) => {
        const code = c.charCodeAt(0);
        if (c === "\n") return "\\n";
        if (c === "\\" || c === '"') return "\\" + c;
        // Octal digits end by themselves, and "??" would begin a trigraph.
        if (code < 32 || code > 126 || c === "?") return "\\" + code.toString(8).padStart(3, "0");
        return c;
    });
    return '    "' + text.join("") + '"';
});
writeFileSync(
    process.argv[2],
    '#include "view_page/vpg_Html.h"\n\nstd::string_view vpg_PageText() {\n    static constexpr char text[] =\n' +
        literals.join("\n") +
        ";\n    return {text, sizeof text - 1};\n}\n",
);
if (process.argv[3]) writeFileSync(process.argv[3], page);
