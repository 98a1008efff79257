#!/usr/bin/env bash
# Installs tovrin into a scratch prefix and builds the examples against it twice: through
# find_package(tovrin CONFIG) and through pkg-config. Runs each example. Then installs it with
# another --prefix than the configured one, moves that tree, and builds and runs the examples
# against the moved tree the same two ways.
set -euo pipefail
cd "$(dirname "$0")/.."
build=build/package
prefix=$PWD/$build/prefix
cmake -S . -B $build/lib -DCMAKE_BUILD_TYPE=Release -DTOVRIN_BUILD_TESTS=OFF \
  -DTOVRIN_BUILD_BENCHMARKS=OFF -DCMAKE_INSTALL_PREFIX="$prefix" >/dev/null
cmake --build $build/lib -j2
cmake --install $build/lib >/dev/null
cmake -S examples -B $build/examples -DCMAKE_PREFIX_PATH="$prefix" >/dev/null
cmake --build $build/examples -j2
for example in examples/*.cpp; do
  name=$(basename "$example" .cpp)
  "$build/examples/$name" >/dev/null
  PKG_CONFIG_PATH="$prefix/lib/pkgconfig" g++ "$example" -o "$build/$name-pkgconfig" \
    $(PKG_CONFIG_PATH="$prefix/lib/pkgconfig" pkg-config --cflags --libs tovrin)
  "$build/$name-pkgconfig" >/dev/null
done
echo "package check: find_package and pkg-config consumers built and ran"

# An install put elsewhere with --prefix, then moved: nothing may point at either old place.
elsewhere=$PWD/$build/elsewhere
moved=$PWD/$build/moved
rm -rf "$elsewhere" "$moved" $build/examples-moved
cmake --install $build/lib --prefix "$elsewhere" >/dev/null
mv "$elsewhere" "$moved"
flags=$(PKG_CONFIG_PATH="$moved/lib/pkgconfig" pkg-config --cflags --libs tovrin)
case "$flags" in
  *"$moved/"*) ;;
  *) echo "pkg-config does not point into the moved install: $flags" >&2; exit 1 ;;
esac
case "$flags" in
  *"$elsewhere"* | *"$prefix"*)
    echo "pkg-config points at a former place: $flags" >&2; exit 1 ;;
esac
cmake -S examples -B $build/examples-moved -DCMAKE_PREFIX_PATH="$moved" >/dev/null
cmake --build $build/examples-moved -j2
for example in examples/*.cpp; do
  name=$(basename "$example" .cpp)
  "$build/examples-moved/$name" >/dev/null
  g++ "$example" -o "$build/$name-pkgconfig-moved" $flags
  "$build/$name-pkgconfig-moved" >/dev/null
done
widgetflags=$(PKG_CONFIG_PATH="$moved/lib/pkgconfig" pkg-config --cflags --libs tovrin-widgets)
case "$widgetflags" in
  *"$elsewhere"* | *"$prefix"*)
    echo "tovrin-widgets.pc points at a former place: $widgetflags" >&2; exit 1 ;;
esac
echo "package check: a moved install serves find_package and pkg-config consumers"
cmake -S examples/subdirectory -B $build/subdirectory -DCMAKE_BUILD_TYPE=Release >/dev/null
cmake --build $build/subdirectory -j2
"$build/subdirectory/quickstart" >/dev/null
echo "package check: add_subdirectory consumer built and ran"
# The widgets component: a find_package(... COMPONENTS widgets) consumer and a pkg-config one,
# then the installed tovrin-studio's offscreen screenshot, which must not be blank.
export QT_QPA_PLATFORM=offscreen
cmake -S examples/widgets -B $build/widgets -DCMAKE_PREFIX_PATH="$prefix" >/dev/null
cmake --build $build/widgets -j2
expected=$'3/5 -1/5\n-1/5 2/5'
[ "$("$build/widgets/fraction_inverse")" = "$expected" ]
PKG_CONFIG_PATH="$prefix/lib/pkgconfig" g++ examples/widgets/fraction_inverse.cpp \
  -o "$build/fraction_inverse-pkgconfig" \
  $(PKG_CONFIG_PATH="$prefix/lib/pkgconfig" pkg-config --cflags --libs tovrin-widgets)
[ "$("$build/fraction_inverse-pkgconfig")" = "$expected" ]
rm -f "$build/studio.png"
"$prefix/bin/tovrin-studio" --screenshot "$build/studio.png"
"$build/widgets/screenshot_check" "$build/studio.png"
echo "package check: widgets consumers built and ran; tovrin-studio's screenshot is not blank"
