// Runs the unit tests: bundles each test/*.test.ts and lets node run it.
import { spawnSync } from "node:child_process";
import { mkdtempSync, readdirSync, rmSync } from "node:fs";
import { tmpdir } from "node:os";
import { dirname, join } from "node:path";
import { fileURLToPath } from "node:url";
import { build } from "esbuild";

const here = dirname(fileURLToPath(import.meta.url));
const out = mkdtempSync(join(tmpdir(), "qrx_unit_"));
const tests = readdirSync(here).filter((name) => name.endsWith(".test.ts"));
await build({
    entryPoints: tests.map((name) => join(here, name)),
    bundle: true, platform: "node", format: "esm", outdir: out, outExtension: { ".js": ".mjs" }, logLevel: "warning",
});
const run = spawnSync(process.execPath, ["--test", ...tests.map((name) => join(out, name.replace(".ts", ".mjs")))], { stdio: "inherit" });
rmSync(out, { recursive: true });
process.exit(run.status ?? 1);
