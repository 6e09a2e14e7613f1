"""A copy of the project in which sources may be changed, with its own build."""

import os
import re
import resource
import shutil
import subprocess

# What is built and tested: the library and its own tests. The test programs need not be linked
# again when the library has changed.
SETTINGS = ["-DCMAKE_CXX_FLAGS_DEBUG=", "-DCMAKE_LINK_DEPENDS_NO_SHARED=ON",
            "-DHMISTATEMACHINE_WERROR=OFF", "-DHMISTATEMACHINE_BUILD_EXAMPLES=OFF",
            "-DHMISTATEMACHINE_BUILD_DOCS=OFF", "-DHMISTATEMACHINE_BUILD_QUICK=OFF",
            "-DHMISTATEMACHINE_BUILD_RULES_TOOL=OFF", "-DHMISTATEMACHINE_TEST_PACKAGE=OFF"]
PARTS = ["CMakeLists.txt", "CMakePresets.json", "cmake", "examples/tutorial", "platform", "src", "tests"]
LABELS = "^(flows|hmi|internal|lifetime|misuse|named|popup|random)$"
MEMORY = 4 << 30 # bytes for a test that has gone wild
STEPS = "2000" # of each random test: they all take part in each mutation that survives
# "12/66 Test  #3: name .....***Timeout  30.01 sec", also "name ...Subprocess aborted***Exception: "
FAILED_TEST = re.compile(r"^ *\d+/\d+ Test +#\d+: (\S+) [^*\n]*\*\*\*(\w+)", re.MULTILINE)


class Failure:
    """Tests that failed, and whether all they did was to take too long."""

    def __init__(self, names, timeout):
        self.names = names
        self.timeout = timeout


class WorkCopy:
    def __init__(self, project, folder):
        self.project = project
        self.source = folder / "source"
        self.build_dir = folder / "build"
        self.log = folder / "log.txt"

    def update(self):
        """Makes the copy like the project; what is alike already keeps its time."""
        wanted = set()
        for part in PARTS:
            top = self.project / part
            wanted.update(p for p in ([top] if top.is_file() else top.rglob("*"))
                          if p.is_file() and "__pycache__" not in p.parts)
        names = {p.relative_to(self.project) for p in wanted}
        for name in names:
            copy = self.source / name
            if not copy.exists() or copy.read_bytes() != (self.project / name).read_bytes():
                copy.parent.mkdir(parents=True, exist_ok=True)
                shutil.copyfile(self.project / name, copy)
        for copy in [p for p in self.source.rglob("*") if p.is_file()]:
            if copy.relative_to(self.source) not in names:
                copy.unlink()

    def configure(self):
        command = ["cmake", "--preset", "dev", "-S", self.source, "-B", self.build_dir, *SETTINGS]
        return self._run(command, cwd=self.source)

    def build(self, targets=("all",)):
        return self._run(["cmake", "--build", self.build_dir, "--target", *targets])

    def tests(self):
        """The names of all."""
        listing = subprocess.run(self._ctest("-N"), capture_output=True, text=True, check=True)
        return re.findall(r"^ *Test +#\d+: (\S+)", listing.stdout, re.MULTILINE)

    def test(self, names, jobs=2):
        """The first failure of these tests; none when all pass."""
        chosen = "^(" + "|".join(names) + ")$"
        run = subprocess.run(self._ctest("-R", chosen, "-j", str(jobs), "--stop-on-failure"),
                             capture_output=True, text=True, preexec_fn=limit_memory,
                             env={**os.environ, "HMI_RANDOM_STEPS": STEPS})
        with self.log.open("a") as log:
            log.write(run.stdout)
        failed = dict(FAILED_TEST.findall(run.stdout))
        if bool(failed) != (run.returncode != 0):
            raise RuntimeError(f"ctest cannot be understood, see {self.log}")
        if not failed:
            return None
        return Failure(sorted(failed), all(why == "Timeout" for why in failed.values()))

    def _ctest(self, *arguments):
        return ["ctest", "--test-dir", self.build_dir, "-L", LABELS, *arguments]

    def _run(self, command, **options):
        with self.log.open("a") as log:
            return subprocess.run(command, stdout=log, stderr=log, **options).returncode == 0


def limit_memory():
    resource.setrlimit(resource.RLIMIT_AS, (MEMORY, MEMORY))
