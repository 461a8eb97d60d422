"""A customer of 270 networks and 300 profiles, 10 of which stand for every network, on a phone with two SIMs:
installed in configuration mode, then upgraded on a normal start. Looked at from outside, with the sqlite3 program.

    test_install.py ZEL-PROGRAM
"""

import json
import shutil
import subprocess
import sys
import tempfile
import unittest
from pathlib import Path

ROOT = Path(__file__).resolve().parents[2]
MEMORY = Path("/dev/shm")

NETWORKS, PROFILES, EVERYWHERE = 270, 300, 10
ROWS = 2990  # 10 profiles for 270 networks each, and 290 of their own

# Columns of a profile's row that the section store keeps, in the order of their keys.
MIRRORED = ("profile_id profile_name apn auth_type auth_id auth_pwd pdp_protocol roam_pdp_protocol proxy_ip_addr home_url "
            "linger_time traffic_class is_static_ip_addr ip_addr is_static_dns_addr dns_addr1 dns_addr2 network_info_id "
            "svc_category_id hidden editable default_internet_con user_defined is_roaming_apn profile_enable").split()


def run(*command: object) -> str:
    return subprocess.run([str(c) for c in command], check=True, capture_output=True, text=True).stdout


def ini(path: Path) -> dict[str, dict[str, str]]:
    sections: dict[str, dict[str, str]] = {}
    keys: dict[str, str] = {}
    for line in path.read_text().splitlines():
        if line.startswith("["):
            keys = sections.setdefault(line[1:-1], {})
        elif line:
            key, value = line.split("=", 1)
            keys[key.strip()] = value.strip().strip('"')
    return sections


class State:
    """The databases and the section store as a run left them."""

    def __init__(self, phone: Path, folder: Path):
        shutil.copytree(phone / "opt/dbspace", folder / "dbspace")
        shutil.copytree(phone / "opt/system/zel-default/data", folder / "data")
        self.folder = folder

    def rows(self, sim: int, sql: str) -> list[dict]:
        database = self.folder / "dbspace" / (".dnet.db" if sim == 1 else ".dnet2.db")
        return json.loads(run("sqlite3", "-readonly", "-json", database, sql) or "[]")

    def values(self, sim: int, sql: str) -> list[tuple]:
        return [tuple(row.values()) for row in self.rows(sim, sql)]

    def mirror(self, sim: int, group: str) -> dict[str, dict[str, str]]:
        return ini(self.folder / "data" / f"zel-default-data-{group}{'-2' if sim == 2 else ''}.ini")


STATES: dict[str, State] = {}


def setUpModule():
    folder = tempfile.TemporaryDirectory(dir=MEMORY if MEMORY.is_dir() else None)
    unittest.addModuleCleanup(folder.cleanup)
    work = Path(folder.name)
    run(sys.executable, "-B", ROOT / "scripts/make-large-customer", NETWORKS, PROFILES, work / "package", "--package")
    phone = work / "phone"
    run(ZEL, "--root", phone, "phone", "create", "--package", work / "package", "--sims", "2")
    run(ZEL, "--root", phone, "install", "BIG")
    STATES["install"] = State(phone, work / "install")
    run(ZEL, "--root", phone, "reboot")
    run(ZEL, "--root", phone, "boot")
    STATES["upgrade"] = State(phone, work / "upgrade")


class Checks:
    """What holds for both SIMs, after the install as after the upgrade; the classes at the end say which."""

    step: str
    sim: int
    first_profile: int  # the id of the first row that the step wrote

    def values(self, sql: str) -> list[tuple]:
        return STATES[self.step].values(self.sim, sql)

    def mirror(self, group: str) -> dict[str, dict[str, str]]:
        return STATES[self.step].mirror(self.sim, group)

    def assert_none(self, table: str, where: str):
        self.assertEqual(self.values(f"select * from {table} where {where} limit 3"), [])

    def test_networks_have_ids_in_the_order_of_the_file(self):
        self.assertEqual(self.values("select count(*), min(network_info_id), max(network_info_id), "
                                     "count(distinct mccmnc) from network_info"), [(270, 1, 270, 270)])
        self.assertEqual(self.values("select * from network_info where network_info_id in (1, 99, 270)"),
                         [(1, "Network 001", "001001"), (99, "Network 099", "001099"), (270, "Network 270", "001270")])
        self.assert_none("network_info", "mccmnc <> printf('001%03d', network_info_id)")

    def test_profiles_are_a_row_for_each_network(self):
        self.assertEqual(self.values("select count(*), min(profile_id), max(profile_id) from pdp_profile"),
                         [(ROWS, self.first_profile, self.first_profile + ROWS - 1)])
        self.assertEqual(self.values("select substr(profile_name, 1, 5), count(*), count(distinct profile_name), "
                                     "count(distinct network_info_id) from pdp_profile group by 1"),
                         [("Every", 2700, 10, 270), ("Inter", 290, 290, 270)])

    def test_profiles_stand_in_the_order_of_the_file_and_of_the_networks(self):
        place = f"(profile_id - {self.first_profile})"
        self.assert_none("pdp_profile", f"{place} < 2700 and profile_name <> 'Everywhere ' || ({place} / 270 + 1)")
        self.assert_none("pdp_profile", f"{place} < 2700 and network_info_id <> {place} % 270 + 1")
        self.assert_none("pdp_profile", f"{place} >= 2700 and profile_name <> 'Internet ' || ({place} - 2699)")
        self.assert_none("pdp_profile", f"{place} >= 2700 and network_info_id <> ({place} - 2700) % 270 + 1")

    def test_profiles_have_the_columns_of_the_file(self):
        columns = "apn, auth_type, auth_id, auth_pwd, pdp_protocol, roam_pdp_protocol, proxy_ip_addr, home_url"
        plain = ("apn1.example.com", 0, "", "", 6, 2, "", "")
        secure = ("apn4.example.com", 2, "user4", "secret4", 6, 2, "192.0.2.1:8004", "http://home4.example.com")
        for name, values in (("Everywhere 1", plain), ("Everywhere 4", secure)):
            self.assertEqual(self.values(f"select distinct {columns} from pdp_profile where profile_name = '{name}'"),
                             [values])
        self.assert_none("pdp_profile",
                         "linger_time <> 300 or traffic_class <> 0 or is_static_ip_addr <> 0 or ip_addr is not null "
                         "or is_static_dns_addr <> 0 or dns_addr1 is not null or dns_addr2 is not null or hidden <> 0 "
                         "or editable <> 1 or user_defined <> 0 or is_roaming_apn <> 0 or profile_enable <> 1")

    def test_profiles_of_the_handles_are_default_connections(self):
        self.assertEqual(self.values("select svc_category_id, default_internet_con, count(*), "
                                     "count(distinct network_info_id) from pdp_profile group by 1, 2 order by 1, 2"),
                         [(1, 0, 2890, 270), (1, 1, 50, 50), (2, 1, 50, 50)])
        self.assert_none("pdp_profile", "default_internet_con = 1 and network_info_id > 50")
        self.assert_none("pdp_profile", "svc_category_id = 2 and profile_name <> 'Everywhere 1'")
        self.assert_none("pdp_profile", "svc_category_id = 1 and default_internet_con = 1 "
                                        "and profile_name <> 'Internet ' || network_info_id")

    def test_profiles_are_mirrored_as_they_are(self):
        mirror = self.mirror("connection")["connection"]
        self.assertEqual(mirror["count"], "2990")
        self.assertEqual(len(mirror), 25 * ROWS + 1)
        rows = STATES[self.step].rows(self.sim, "select * from pdp_profile order by profile_id")
        for number, row in enumerate(rows, 1):
            expected = {f"{c}_{number}": "" if row[c] is None else str(row[c]) for c in MIRRORED}
            self.assertEqual({key: mirror.get(key) for key in expected}, expected)

    def test_profiles_of_the_file_know_their_last_row(self):
        spec = self.mirror("connection")["spec"]
        self.assertEqual((len(spec), spec["count"]), (301, "300"))
        for index, row in ((1, 270), (2, 540), (10, 2700), (11, 2701), (300, 2990)):
            self.assertEqual(spec[f"profile_id_{index}"], str(self.first_profile + row - 1))

    def test_dormancy_is_one_row_a_network(self):
        self.assertEqual(self.values("select count(*), min(dormant_id), max(dormant_id) from fast_dormancy"),
                         [(270, 0, 269)])
        self.assert_none("fast_dormancy", "network_info_id <> dormant_id + 1")
        times = "lcd_on_timeout, lcd_off_timeout, lcd_on_timeout_rel8, lcd_off_timeout_rel8"
        self.assertEqual(self.values(f"select {times}, count(*), sum(network_info_id % 10 = 0) from fast_dormancy "
                                     f"group by {times} order by 3"),
                         [(5000, 2500, -1, -1, 243, 0), (5000, 2500, 32300, -1, 27, 27)])

    def test_dormancy_is_mirrored_item_by_item(self):
        spec = self.mirror("fast-dormancy")["spec"]
        keys = ("network_name", "enable", "lcd", "time_out", "version")
        self.assertEqual((len(spec), spec["count"]), (29 * 5 + 1, "29"))
        self.assertEqual([spec[f"{key}_2"] for key in keys], ["default", "1", "0", "2500", ""])
        self.assertEqual([spec[f"{key}_29"] for key in keys], ["Network 270", "1", "1", "32300", "rel8"])

    def test_limits_of_single_networks_come_before_those_for_all(self):
        self.assertEqual(self.values("select max_pdp_3g, count(*), min(max_id), max(max_id), "
                                     "sum(network_info_id % 10 = 0) from max_pdp group by 1"),
                         [(2, 27, 1, 27, 27), (4, 243, 28, 270, 0)])

    def test_limits_are_mirrored_item_by_item(self):
        mirror = self.mirror("max-pdp")["max_pdp"]
        keys = ("network_name", "max_pdp_2g", "max_pdp_3g")
        self.assertEqual((len(mirror), mirror["count"]), (28 * 3 + 1, "28"))
        self.assertEqual([mirror[f"{key}_1"] for key in keys], ["Network 010", "1", "2"])
        self.assertEqual([mirror[f"{key}_28"] for key in keys], ["default", "2", "4"])


class InstallOfTheFirstSim(Checks, unittest.TestCase):
    step, sim, first_profile = "install", 1, 1


class InstallOfTheSecondSim(Checks, unittest.TestCase):
    step, sim, first_profile = "install", 2, 1


# A network's old rows go before its first new one; those of the others are still there to count from.
class UpgradeOfTheFirstSim(Checks, unittest.TestCase):
    step, sim, first_profile = "upgrade", 1, ROWS + 1


class UpgradeOfTheSecondSim(Checks, unittest.TestCase):
    step, sim, first_profile = "upgrade", 2, ROWS + 1


if __name__ == "__main__":
    ZEL = Path(sys.argv.pop(1)).resolve()
    unittest.main()
