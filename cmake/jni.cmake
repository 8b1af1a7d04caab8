# Finds jni.h and jni_md.h of an installed JDK: JAVA_INCLUDE_PATH and JAVA_INCLUDE_PATH2, both may
# be given. Only the headers are needed: the library is loaded by a Java VM and links none. They
# are the same for every machine, so that a cross build takes them from the host.
find_program(JAVAC javac HINTS ENV JAVA_HOME PATH_SUFFIXES bin)
set(jdk)
if(JAVAC)
  file(REAL_PATH ${JAVAC} jdk)
  cmake_path(GET jdk PARENT_PATH jdk)
  cmake_path(GET jdk PARENT_PATH jdk)
endif()
find_path(JAVA_INCLUDE_PATH jni.h
          HINTS ENV JAVA_HOME ${jdk} PATHS /usr/lib/jvm/default-java
          PATH_SUFFIXES include NO_CMAKE_FIND_ROOT_PATH REQUIRED)
find_path(JAVA_INCLUDE_PATH2 jni_md.h
          HINTS ${JAVA_INCLUDE_PATH} PATH_SUFFIXES linux darwin NO_CMAKE_FIND_ROOT_PATH REQUIRED)
