"""A copy of the tree to change: what is in it by hand, a quick build of its library, its checks."""

import hashlib
import os
import shutil
import subprocess
import sys
import tempfile
from pathlib import Path

from generator import load

TOP = load.FOLDER.parent
PARTS = ["gateway", "jni", "host/include", "dictionary", "docs", "tests/support",
         "tests/dictionary", "tests/fuzz", "tests/vectors", "java"]
COMPILE = ["-std=c++17", "-O0", "-fPIC", "-fvisibility=hidden", "-I.", "-Ihost/include"]


class Workshop:
    """The copy; it goes away with the context that it is made in."""

    def __enter__(self):
        self.top = Path(tempfile.mkdtemp(prefix="dictionary-"))
        for part in PARTS:
            shutil.copytree(TOP / part, self.top / part,
                            ignore=shutil.ignore_patterns("__pycache__", "corpus"))
        self.objects = {}
        self.java = _java_home()
        return self

    def __exit__(self, *_):
        shutil.rmtree(self.top)

    def replace(self, path, old, new):
        """Changes a file; the old text must stand there once."""
        file = self.top / path
        text = file.read_text(encoding="utf-8")
        if text.count(old) != 1:
            raise SystemExit(f"{path} has {old!r} {text.count(old)} times")
        file.write_text(text.replace(old, new), encoding="utf-8")

    def write(self, path, text):
        (self.top / path).write_text(text, encoding="utf-8")

    def read(self, path):
        return (self.top / path).read_text(encoding="utf-8")

    def contents(self):
        """What stands in each source, by its path."""
        return {str(path.relative_to(self.top)): path.read_bytes()
                for path in self.top.glob("**/*")
                if path.suffix in (".cpp", ".h", ".inc", ".json", ".java", ".md", ".txt")}

    def run(self, *command, **options):
        return subprocess.run(command, cwd=self.top, capture_output=True, text=True, check=False,
                              **options)

    def generate(self, *arguments):
        return self.run(sys.executable, "dictionary/generate", *arguments)

    def build(self):
        """Compiles what changed since the last time and links; what the compiler says."""
        gateway = sorted([*self.top.glob("gateway/*/*.cpp"), *self.top.glob("jni/*.cpp")])
        gateway = [each for each in gateway if each.name != "heap.cpp"]
        support = sorted(self.top.glob("tests/support/*.cpp"))
        support.append(self.top / "tests/dictionary/answer.cpp")
        said = self._compile(gateway + support)
        if said:
            return said
        library = self.run("g++", "-shared", "-o", "libquorvane.so", *map(self._object, gateway))
        program = self.run("g++", "-rdynamic", "-o", "dictionary_answers",
                           *map(self._object, support), "-ldl")
        return library.stderr + program.stderr

    def compile_client(self):
        """Compiles what ships of the Java side; what the compiler says."""
        sources = map(str, self.top.glob("java/client/**/*.java"))
        said = self.run("javac", "-proc:none", "-encoding", "UTF-8", "-d", "classes",
                        "-cp", "/usr/share/java/org.jetbrains.annotations-common.jar",
                        *sources)
        return said.stderr if said.returncode else ""

    def check(self, name, environment=None):
        """A check of the copy's own: what it finds, or nothing."""
        path = dict(os.environ, LD_LIBRARY_PATH=str(self.top), **(environment or {}))
        run = self.run(sys.executable, "tests/dictionary/run", name,
                       str(self.top / "dictionary_answers"), env=path)
        return "" if run.returncode == 0 else run.stdout + run.stderr

    def _compile(self, sources):
        headers = hashlib.sha1()
        for header in sorted([*self.top.glob("*/**/*.h"), *self.top.glob("tests/**/*.inc")]):
            headers.update(header.read_bytes())
        running = []
        for source in sources:
            state = headers.hexdigest() + hashlib.sha1(source.read_bytes()).hexdigest()
            if self.objects.get(source) == state:
                continue
            self.objects[source] = state
            running.append(subprocess.Popen(
                ["g++", *COMPILE, f"-I{self.java}/include", f"-I{self.java}/include/linux", "-c",
                 str(source), "-o", self._object(source)],
                cwd=self.top, stderr=subprocess.PIPE, text=True))
            if len(running) == 2:
                said = running.pop(0).communicate()[1]
                if said:
                    return said
        return "".join(each.communicate()[1] for each in running)

    def _object(self, source):
        return str(source) + ".o"


def _java_home():
    javac = shutil.which("javac")
    return Path(javac).resolve().parent.parent if javac else ""
