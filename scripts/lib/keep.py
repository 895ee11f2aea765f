"""What a tour leaves behind besides its pictures, in plain files of the same names for either edition: what the stand-in
servers received, what the program made, what its pages say. same_bytes.py compares the two."""

import os
import shutil

import mail

ROOT = os.path.dirname(os.path.dirname(os.path.dirname(os.path.abspath(__file__))))


def folder(edition):
    return f"{ROOT}/build/{edition}-tour"


class Keeper:
    def __init__(self, edition):
        self.folder = folder(edition)
        shutil.rmtree(self.folder, ignore_errors=True)
        os.makedirs(self.folder)

    def keep(self, name, content):
        """Bytes as they are, text in UTF-8, a list with a line for each of its texts."""
        if isinstance(content, (list, tuple)):
            content = "".join(f"{line}\n" for line in content)
        with open(f"{self.folder}/{name}", "wb") as file:
            file.write(content.encode() if isinstance(content, str) else content)

    def tell(self, name, content):
        """Keeps texts, and prints them."""
        lines = content.splitlines() if isinstance(content, str) else content
        print("\n".join(f"{name.split('.')[0]}: {line}" for line in lines))
        self.keep(name, content)

    def mail(self, found):
        """What was left for mail programs."""
        self.keep("account.txt", mail.account_lines(found.accounts))
        if found.profile is not None:
            self.keep("bi.prf", found.profile)

    def report(self, folder):
        """The newest of a support server."""
        heads = sorted(name for name in os.listdir(folder) if name.endswith(".head"))
        for ending in ("head", "body") if heads else ():
            shutil.copy(f"{folder}/{heads[-1][:-len('head')]}{ending}", f"{self.folder}/report.{ending}")
