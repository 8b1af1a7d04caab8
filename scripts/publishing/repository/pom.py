"""The texts by which Maven and Gradle know an artifact."""

from xml.sax.saxutils import escape

from .artifacts import GROUP

_POM = """\
<?xml version="1.0" encoding="UTF-8"?>
<project xmlns="http://maven.apache.org/POM/4.0.0"
         xmlns:xsi="http://www.w3.org/2001/XMLSchema-instance"
         xsi:schemaLocation="http://maven.apache.org/POM/4.0.0 http://maven.apache.org/xsd/maven-4.0.0.xsd">
  <modelVersion>4.0.0</modelVersion>
  <groupId>{group}</groupId>
  <artifactId>{name}</artifactId>
  <version>{version}</version>
  <packaging>{packaging}</packaging>
  <name>{name}</name>
  <description>{description}</description>
{dependencies}</project>
"""

_DEPENDENCY = """\
    <dependency>
      <groupId>{group}</groupId>
      <artifactId>{name}</artifactId>
      <version>{version}</version>
      <scope>compile</scope>
    </dependency>
"""

_INDEX = """\
<?xml version="1.0" encoding="UTF-8"?>
<metadata>
  <groupId>{group}</groupId>
  <artifactId>{name}</artifactId>
  <versioning>
    <latest>{latest}</latest>
    <release>{latest}</release>
    <versions>
{versions}    </versions>
  </versioning>
</metadata>
"""


def of(artifact, version):
    """The POM of an artifact; those that it uses come in its own version."""
    uses = "".join(_DEPENDENCY.format(group=GROUP, name=name, version=version)
                   for name in artifact.uses)
    return _POM.format(
        group=GROUP, name=artifact.name, version=version, packaging=artifact.packaging,
        description=escape(artifact.purpose[0].upper() + artifact.purpose[1:]),
        dependencies=f"  <dependencies>\n{uses}  </dependencies>\n" if uses else "")


def index_of(artifact, versions):
    """maven-metadata.xml, which names the versions, the latest last."""
    versions = sorted(versions, key=lambda version: [int(part) for part in version.split(".")])
    rows = "".join(f"      <version>{version}</version>\n" for version in versions)
    return _INDEX.format(group=GROUP, name=artifact.name, latest=versions[-1], versions=rows)
