"""What the program has left for mail programs, read as others read it: the account in the registry by the database's own
library, the profile file by its code page."""

import configparser
import dataclasses
import os
import sqlite3

ACCOUNTS = ("Software", "Microsoft", "Internet Account Manager", "Accounts")
CURRENT_USER = 0x80000001
TEXT, NUMBER = 1, 4
CODE_PAGE = "cp1255"


def data_folder():
    return f"{os.environ['XDG_DATA_HOME']}/quendra"


def profile_path():
    return f"{data_folder()}/drive_c/WINDOWS/bi.prf"


def as_value(kind, data):
    """As a user of a registry editor reads it."""
    if kind == NUMBER and len(data) == 4:
        return int.from_bytes(data, "little")
    if kind == TEXT and data.endswith(b"\0"):
        return data[:-1].decode(CODE_PAGE)
    raise ValueError(f"a value of type {kind} with the bytes {data.hex()}")


def accounts_in_database():
    """The mail accounts in the registry: name and value of each entry, by the account's name."""
    with sqlite3.connect(f"file:{data_folder()}/registry.sqlite?mode=ro", uri=True) as registry:
        key = CURRENT_USER
        for name in ACCOUNTS:
            row = registry.execute("SELECT number FROM keys WHERE parent = ? AND name = ?", (key, name)).fetchone()
            if row is None:
                return {}
            key = row[0]
        found = registry.execute("SELECT number, name FROM keys WHERE parent = ? ORDER BY name", (key,)).fetchall()
        return {
            account: {
                name: as_value(kind, data)
                for name, kind, data in registry.execute(
                    "SELECT name, type, bytes FROM data WHERE key = ? ORDER BY name", (number,)
                )
            }
            for number, account in found
        }


@dataclasses.dataclass
class Left:
    """What the program has left: accounts by their names, each with its values by name, and the profile file's bytes."""

    accounts: dict
    profile: bytes | None
    mode: str = ""

    def sections(self):
        return profile(self.profile) if self.profile is not None else {}


def left():
    """By the Linux edition."""
    path = profile_path()
    if not os.path.exists(path):
        return Left(accounts_in_database(), None)
    with open(path, "rb") as file:
        return Left(accounts_in_database(), file.read(), f", mode {os.stat(path).st_mode & 0o777:o}")


def profile(content):
    """The profile file's keys and values by section, as a reader of such files takes them. A file whose lines don't all
    end as they should, or whose bytes are no text, is an error."""
    text = content.decode(CODE_PAGE)
    if not text.endswith("\r\n") or "\n" in text.replace("\r\n", ""):
        raise ValueError("the profile file has a line that doesn't end in CR and LF")
    reader = configparser.ConfigParser(delimiters=("=",), interpolation=None, strict=True)
    reader.optionxform = str
    reader.read_string(text)
    return {section: dict(reader[section]) for section in reader.sections()}


def account_lines(accounts):
    return [f"{account}: {name} = {value}" for account, values in accounts.items() for name, value in values.items()]


def lines(found=None):
    """What stands in both, a line an entry. Of the profile file the section with the account, and how much else there is."""
    found = found or left()
    said = [f"registry: {line}" for line in account_lines(found.accounts)]
    if sections := found.sections():
        said.append(
            f"profile: {len(found.profile)} bytes{found.mode}, {len(sections)} sections, "
            f"{sum(map(len, sections.values()))} entries"
        )
        said += [f"profile: [Account1] {name} = {value}" for name, value in sections["Account1"].items()]
    return said


def wrong_with(user_name, full_name, domain, found=None):
    """What is wrong with the account that both should hold, a sentence each."""
    found = found or left()
    account = found.accounts.get(domain[:1].upper() + domain[1:], {})
    expected = {
        "POP3 User Name": user_name,
        "SMTP Display Name": full_name,
        "SMTP Email Address": f"{user_name}@{domain}",
    }
    wrong = differences("registry", account, expected)
    expected = {"POP3UserName": user_name, "DisplayName": full_name, "EmailAddress": f"{user_name} @{domain}"}
    return wrong + differences("profile file", found.sections().get("Account1", {}), expected)


def differences(place, values, expected):
    return [
        f"the {place}'s {name!r} is {values.get(name)!r} and should be {value!r}"
        for name, value in expected.items()
        if values.get(name) != value
    ]
