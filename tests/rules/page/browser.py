"""Chromium without a window, and the page of a matrix as a reader meets it."""

import json
import os
import tempfile
from pathlib import Path

from selenium import webdriver
from selenium.webdriver import ActionChains, Keys
from selenium.webdriver.chrome.service import Service
from selenium.webdriver.common.by import By

FLAGS = (
    "--headless", "--no-sandbox", "--disable-gpu", "--disable-quic", "--no-first-run",
    "--disable-background-networking", "--disable-component-update", "--disable-sync",
    "--disable-dev-shm-usage", "--force-device-scale-factor=1",
)

# Two frames: one in which the page draws what was asked for, one to know that it has.
SETTLE = """
const frame = () => new Promise(requestAnimationFrame);
const settle = async () => { await frame(); await frame(); };
"""

# The grid holds only what is in sight, so a name is looked for screen by screen.
FIND_CELL = SETTLE + """
const [front, requested, done] = arguments;
const grid = document.getElementById('grid');
const shown = (selector, name) => [...grid.querySelectorAll(selector)]
    .find(node => !node.closest('[hidden]') && node.textContent === name);
async function search(selector, name, side, extent, view) {
    for (let at = 0; at < grid[extent]; at += grid[view] / 4) {
        grid[side] = at;
        await settle();
        const found = shown(selector, name);
        if (found) {
            return found;
        }
    }
    return null;
}
(async () => {
    const column = await search(
        '.requested', requested, 'scrollLeft', 'scrollWidth', 'clientWidth');
    const row = column
        && await search('.front', front, 'scrollTop', 'scrollHeight', 'clientHeight');
    const index = column?.getAttribute('aria-colindex');
    done(row && row.parentNode.querySelector(`.cell:not([hidden])[aria-colindex="${index}"]`));
})();
"""


class Browser:
    """Ends chromedriver and Chromium, and removes their files, when its block is left."""

    def __init__(self, chromium, chromedriver):
        self.folder = tempfile.TemporaryDirectory(prefix="matrix-page-")
        options = webdriver.ChromeOptions()
        options.binary_location = chromium
        for flag in (*FLAGS, f"--user-data-dir={self.folder.name}/profile"):
            options.add_argument(flag)
        options.set_capability("goog:loggingPrefs", {"browser": "ALL", "performance": "ALL"})
        # What goes to this machine is not for a proxy.
        os.environ["no_proxy"] = os.environ["NO_PROXY"] = "localhost,127.0.0.1"
        try:
            self.driver = webdriver.Chrome(service=Service(chromedriver), options=options)
        except BaseException:
            self.folder.cleanup()
            raise
        self.emulate("light")
        self.command("Emulation.setDeviceMetricsOverride",
                     width=1280, height=800, deviceScaleFactor=1, mobile=False)

    def close(self):
        try:
            self.driver.quit()
        finally:
            self.folder.cleanup()

    def command(self, name, **parameters):
        return self.driver.execute_cdp_cmd(name, parameters)

    def emulate(self, scheme):
        self.command("Emulation.setEmulatedMedia",
                     features=[{"name": "prefers-color-scheme", "value": scheme}])

    def save(self, name, text):
        path = Path(self.folder.name) / f"{name}.html"
        path.write_text(text, encoding="utf-8")
        return path

    def open(self, path, link=""):
        # By way of an empty page, because a change of the link alone would not load the page.
        self.driver.get("about:blank")
        self.errors()
        self.requests()
        self.driver.get(f"{Path(path).resolve().as_uri()}{link}")
        self.settle()

    def settle(self):
        self.wait(SETTLE + "settle().then(arguments[0]);")

    def run(self, script, *arguments):
        return self.driver.execute_script(script, *arguments)

    def wait(self, script, *arguments):
        return self.driver.execute_async_script(script, *arguments)

    def errors(self):
        """What was written to the console since this was last asked."""
        return [entry["message"] for entry in self.driver.get_log("browser")]

    def requests(self):
        """The addresses that were asked for since this was last asked."""
        messages = [json.loads(entry["message"])["message"]
                    for entry in self.driver.get_log("performance")]
        return [message["params"]["request"]["url"] for message in messages
                if message["method"] == "Network.requestWillBeSent"]

    # --- What the reader sees and does ---

    def find(self, selector):
        return self.driver.find_element(By.CSS_SELECTOR, selector)

    def texts(self, selector):
        """Of what the grid shows, in the order of its rows and columns."""
        return self.run("""
            const order = node => Number(node.closest('[role="row"]').getAttribute('aria-rowindex'))
                * 1e6 + Number(node.getAttribute('aria-colindex'));
            return [...document.querySelectorAll(`#grid ${arguments[0]}`)]
                .filter(node => !node.closest('[hidden]'))
                .sort((a, b) => order(a) - order(b)).map(node => node.textContent);""", selector)

    def cell(self, front, requested):
        cell = self.wait(FIND_CELL, front, requested)
        assert cell is not None, f"no cell of {front!r} and {requested!r}"
        return cell

    def tip_of(self, node):
        """The lines of the tooltip when the mouse is over a node."""
        ActionChains(self.driver).move_to_element(self.find("h1")).move_to_element(node).perform()
        self.settle()
        return self.run("""return [...document.querySelectorAll('#tip:not([hidden]) > *')]
            .map(node => node.textContent);""")

    def type(self, control, text):
        field = self.find(f"#{control}")
        field.clear()
        field.send_keys(text)
        self.settle()

    def press(self, *keys):
        ActionChains(self.driver).send_keys(*keys).perform()
        self.settle()

    def press_with_control(self, key):
        ActionChains(self.driver).key_down(Keys.CONTROL).send_keys(key).key_up(
            Keys.CONTROL).perform()
        self.settle()

    def click(self, node):
        node.click()
        self.settle()

    def highlight(self, behavior):
        self.click(self.driver.find_element(
            By.XPATH, f"//button[span[@class='label' and text()='{behavior}']]"))

    def counts(self):
        return self.run("""return [...document.querySelectorAll('.behavior:not([hidden])')].map(
            node => [node.querySelector('.label').textContent,
                Number(node.querySelector('.count').textContent)]);""")

    def panel(self):
        return self.find("#panel").text

    def active_cell(self):
        """The popup in front and the requested one of the cell that is announced as active."""
        return self.run("""
            const id = document.getElementById('grid').getAttribute('aria-activedescendant');
            const cell = document.getElementById(id);
            const column = cell.getAttribute('aria-colindex');
            return [cell.parentNode.querySelector('.front').textContent,
                document.querySelector(`.requested[aria-colindex="${column}"]`).textContent];""")
