import "./style/fonts.css";
import "./style/page.css";
import "./style/sheet.css";
import "./style/chord.css";
import { render } from "preact";
import { keepPage } from "./offline/keep";
import { App } from "./page/App";

render(<App />, document.getElementById("page")!);
keepPage();
