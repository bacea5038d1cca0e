# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""A headless Chromium, driven by its WebDriver."""

import json
import os
import shutil
import tempfile

SKIPPED = 77  # as ctest is told
NEEDED = {"chromium": "chromium", "chromedriver": "chromium-driver", "pdftotext": "poppler-utils"}

try:
    from selenium import webdriver
    from selenium.common.exceptions import WebDriverException
    from selenium.webdriver.chrome.options import Options
    from selenium.webdriver.chrome.service import Service
    from selenium.webdriver.common.by import By
    from selenium.webdriver.common.keys import Keys
except ImportError:
    webdriver = None


def why_none():
    """Why there is no browser; nothing where there is one."""
    if webdriver is None:
        return "Python has no selenium (Debian's python3-selenium)"
    for program, package in NEEDED.items():
        if not shutil.which(program):
            return f"there is no {program} (Debian's package {package})"
    if os.geteuid() != 0:
        # Its sandbox needs what not every system lets its users have; without one it runs for root alone.
        try:
            start().quit()
        except WebDriverException as error:
            return f"Chromium does not start for this user: {str(error).splitlines()[0]}"
    return ""


def start():
    # Chromium leaves folders there, whose names nobody is told.
    temporary = tempfile.TemporaryDirectory(ignore_cleanup_errors=True)
    options = Options()
    options.binary_location = shutil.which("chromium")
    for argument in ("--headless=new", "--disable-gpu", "--hide-scrollbars", "--disable-dev-shm-usage"):
        options.add_argument(argument)
    if os.geteuid() == 0:
        options.add_argument("--no-sandbox")  # which Chromium has for other users alone
    options.set_capability("goog:loggingPrefs", {"browser": "ALL", "performance": "ALL"})
    service = Service(shutil.which("chromedriver"), env={**os.environ, "TMPDIR": temporary.name})
    try:
        return Page(webdriver.Chrome(service=service, options=options), temporary)
    except WebDriverException:
        temporary.cleanup()
        raise


class Page:
    """What tests ask of an open page."""

    def __init__(self, driver, temporary):
        self.driver = driver
        self.temporary = temporary
        driver.set_script_timeout(60)

    def quit(self):
        self.driver.quit()
        self.temporary.cleanup()

    def open(self, file, view="", width=1440, height=900, scheme="light"):
        self.command(
            "Emulation.setDeviceMetricsOverride", width=width, height=height, deviceScaleFactor=1, mobile=False
        )
        self.command(
            "Emulation.setEmulatedMedia", features=[{"name": "prefers-color-scheme", "value": scheme}]
        )
        self.driver.get("about:blank")
        self.forget()
        self.driver.get(file.resolve().as_uri() + view)

    def command(self, name, **arguments):
        return self.driver.execute_cdp_cmd(name, arguments)

    def forget(self):
        for log in ("browser", "performance"):
            self.driver.get_log(log)

    def complaints(self):
        return [line["message"] for line in self.driver.get_log("browser")]

    def requests(self):
        messages = (json.loads(line["message"])["message"] for line in self.driver.get_log("performance"))
        return [
            message["params"]["request"]["url"]
            for message in messages
            if message["method"] == "Network.requestWillBeSent"
        ]

    def run(self, script, *arguments):
        return self.driver.execute_script(script, *arguments)

    def wait(self, script, *arguments):
        return self.driver.execute_async_script(script, *arguments)

    def frame(self):
        """Until the page has drawn what it was asked to."""
        self.wait("const done = arguments[0]; requestAnimationFrame(() => requestAnimationFrame(done))")

    def all(self, selector):
        return self.driver.find_elements(By.CSS_SELECTOR, selector)

    def one(self, selector):
        return self.driver.find_element(By.CSS_SELECTOR, selector)

    def click(self, selector, text=None):
        found = [one for one in self.all(selector) if text is None or text in one.text]
        found[0].click()
        self.frame()

    def texts(self, selector):
        return self.run("return [...document.querySelectorAll(arguments[0])].map((one) => one.textContent)", selector)

    def keys(self, *keys):
        for key in keys:
            self.run("return document.activeElement") .send_keys(key)
            self.frame()

    def focused(self):
        return self.run("return document.activeElement.textContent")
