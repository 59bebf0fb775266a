import { Page } from "./page";
import { bytesOfBase64, type Header, Model } from "./data";
import { element } from "./dom";

declare global {
    interface Window {
        /** The page, for programs that embed or test it. */
        qrxPage?: Page;
    }
}

const header = JSON.parse(element("header").textContent ?? "") as Header;
const arrays = element("arrays");
const model = new Model(header, bytesOfBase64((arrays.textContent ?? "").trim()));
// The text isn't needed any more.
arrays.textContent = "";
window.qrxPage = new Page(model);
