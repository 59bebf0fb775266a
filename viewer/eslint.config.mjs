import js from "@eslint/js";
import tseslint from "typescript-eslint";

export default tseslint.config(
    { ignores: ["node_modules/", "dist/", "**/*.mjs"] },
    js.configs.recommended,
    ...tseslint.configs.strict,
    {
        rules: {
            eqeqeq: "error",
            "no-restricted-properties": [
                "error",
                { property: "innerHTML", message: "Names are text: use textContent." },
                { property: "outerHTML", message: "Names are text: use textContent." },
            ],
            "@typescript-eslint/no-non-null-assertion": "error",
        },
    },
);
