"""What is published: one row an artifact."""

from dataclasses import dataclass, field

GROUP = "com.brindlex.kernel.quorvane"


@dataclass(frozen=True)
class Library:
    """A library of others that an artifact carries: its coordinates, its jar, its licence."""

    group: str
    name: str
    jar: str
    licence: str


@dataclass(frozen=True)
class Artifact:
    """An artifact: `uses` names those that come with it, `needs` what its build asks for."""

    name: str
    purpose: str
    packaging: str = "jar"
    uses: list = field(default_factory=list)
    carries: list = field(default_factory=list)
    needs: str = ""

    def main_file(self, folder, version):
        return folder / f"{self.name}-{version}.{self.packaging}"


NDK = "no Android NDK in ANDROID_NDK_HOME"
CONSOLE_LIBRARIES = [
    Library("info.picocli", "picocli", "/usr/share/java/picocli.jar", "Apache-2.0"),
    Library("com.google.code.gson", "gson", "/usr/share/java/gson.jar", "Apache-2.0"),
]

ALL = [
    Artifact("quorvane-client", "the host class and the typed layer, for Java 8 and Android"),
    Artifact("quorvane", "the library for Android, with the diagnostic log",
             packaging="aar", uses=["quorvane-client"], needs=NDK),
    Artifact("quorvane-silent", "the library for Android, without the diagnostic log",
             packaging="aar", uses=["quorvane-client"], needs=NDK),
    Artifact("quorvane-host", "the library for plain machines, for an app's tests",
             uses=["quorvane-client"]),
    Artifact("quorvane-testkit", "the simulated gateway, for an app's tests",
             uses=["quorvane-client"]),
    Artifact("quorvane-console", "explains logs on any machine with Java 17, by java -jar",
             carries=CONSOLE_LIBRARIES),
    Artifact("quorvane-dictionary", "the facts of the protocol as JSON, with their schema"),
]
