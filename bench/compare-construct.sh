#!/usr/bin/env bash
# Call graph construction in fresh processes: two builds of the library side by side (A, the
# reference, and B, the candidate) and LLVM's CallGraph analysis as the peer.
#
#   usage: compare-construct.sh A_BUILD_DIR B_BUILD_DIR [REPS]
#          compare-construct.sh --setup SOURCE_DIR BUILD_DIR
#
# Each build directory must hold bench/FcnCallGraphConstructOnce. For every size (10^4,
# 10^5 and 10^6 fan-out calls, 10^5 scheduler calls) the script runs A and B in turns
# (A B A B ..., REPS times each, default 3), each run a new process that constructs one
# graph; then the LLVM peer (../shared/peers/llvm-callgraph.sh, or $LLVM_PEER) REPS times
# for the fan-out sizes, when `opt` is installed. It prints min and median ns per call
# operation for each, the median heap bytes per edge for A and B, and the ratios of the
# medians B/A and B/LLVM (below 1: B is faster).
#
# --setup makes an older source tree (one without the program, e.g. a worktree of an earlier
# commit) able to serve as A: it copies FcnCallGraphConstructOnce.cpp next to this script
# into SOURCE_DIR/bench, adds its target to SOURCE_DIR/bench/CMakeLists.txt when missing,
# configures BUILD_DIR in Release with the benchmarks when it has no cache yet, and builds
# the program. The source tree is changed; use it on a throwaway worktree.
set -euo pipefail

here=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)
program=bench/FcnCallGraphConstructOnce

setup() {
  local src=$1 build=$2
  cp "$here/FcnCallGraphConstructOnce.cpp" "$src/bench/"
  if ! grep -q FcnCallGraphConstructOnce "$src/bench/CMakeLists.txt"; then
    cat >> "$src/bench/CMakeLists.txt" <<'EOF'

# Added by compare-construct.sh --setup.
add_executable(FcnCallGraphConstructOnce FcnCallGraphConstructOnce.cpp)
target_link_libraries(FcnCallGraphConstructOnce PRIVATE HulCvTools HulBuilder HulPlatform)
EOF
  fi
  if [[ ! -f $build/CMakeCache.txt ]]; then
    cmake -S "$src" -B "$build" -G Ninja -DCMAKE_BUILD_TYPE=Release -DHUL_BUILD_TESTS=OFF \
      -DHUL_BUILD_DEMO=OFF -DHUL_BUILD_BENCH=ON
  fi
  cmake --build "$build" -j2 --target FcnCallGraphConstructOnce
}

if [[ ${1:-} == --setup ]]; then
  [[ $# -eq 3 ]] || { echo "usage: $0 --setup SOURCE_DIR BUILD_DIR" >&2; exit 2; }
  setup "$2" "$3"
  exit 0
fi

if [[ $# -lt 2 || $# -gt 3 ]]; then
  echo "usage: $0 A_BUILD_DIR B_BUILD_DIR [REPS]   |   $0 --setup SOURCE_DIR BUILD_DIR" >&2
  exit 2
fi
a=$1 b=$2 reps=${3:-3}
[[ $reps =~ ^[1-9][0-9]*$ ]] || { echo "REPS must be a positive number" >&2; exit 2; }
for dir in "$a" "$b"; do
  if [[ ! -x $dir/$program ]]; then
    echo "$dir/$program is missing (build it; for an older tree see --setup)" >&2
    exit 2
  fi
done
peer=${LLVM_PEER:-$here/../../shared/peers/llvm-callgraph.sh}
have_llvm=1
if ! command -v opt > /dev/null && ! command -v opt-14 > /dev/null; then
  have_llvm=0
  echo "opt not found: the LLVM peer is skipped (Debian: apt-get install llvm-14)" >&2
elif [[ ! -x $peer ]]; then
  have_llvm=0
  echo "$peer not found: the LLVM peer is skipped" >&2
fi

# The field `key=` of a line of key=value fields.
field() { tr ' ' '\n' | sed -n "s/^$1=//p"; }
# min and median of the numbers on stdin, one a line.
stats() {
  sort -g | awk '{ v[NR] = $1 } END {
    if (NR == 0) { print "- -"; exit }
    m = NR % 2 ? v[(NR + 1) / 2] : (v[NR / 2] + v[NR / 2 + 1]) / 2
    printf "%.1f %.1f\n", v[1], m }'
}
ratio() { awk -v x="$1" -v y="$2" 'BEGIN { if (x == "-" || y == "-" || y == 0) print "-"; else printf "%.2f\n", x / y }'; }

cases=("10000 fanout" "100000 fanout" "1000000 fanout" "100000 scheduler")
log=$(mktemp); trap 'rm -f "$log"' EXIT
for c in "${cases[@]}"; do
  read -r calls shape <<< "$c"
  for ((i = 1; i <= reps; ++i)); do
    for side in A B; do
      dir=$a; [[ $side == B ]] && dir=$b
      line=$("$dir/$program" "$calls" "$shape") || echo "$side $calls $shape: exit status $?" >&2
      echo "$side $calls $shape: $line" >&2
      echo "$side $calls $shape $line" >> "$log"
    done
  done
  if [[ $shape == fanout && $have_llvm == 1 ]]; then
    for ((i = 1; i <= reps; ++i)); do
      line=$("$peer" "$calls") || echo "LLVM $calls: exit status $?" >&2
      echo "LLVM $calls: $line" >&2
      ns=$(sed -n 's/.* \([0-9.]*\) ns per call.*/\1/p' <<< "$line")
      [[ -n $ns ]] && echo "LLVM $calls $shape ns_per_call=$ns" >> "$log"
    done
  fi
done

echo
printf '%-9s %8s | %9s %9s | %9s %9s | %9s %9s | %7s %7s | %6s %7s\n' shape calls \
  "A min" "A med" "B min" "B med" "LLVM min" "LLVM med" "A bytes" "B bytes" "B/A" "B/LLVM"
for c in "${cases[@]}"; do
  read -r calls shape <<< "$c"
  of() { { grep "^$1 $calls $shape " "$log" || true; } | field "$2" | stats; }
  read -r amin amed <<< "$(of A ns_per_call)"
  read -r bmin bmed <<< "$(of B ns_per_call)"
  read -r lmin lmed <<< "$(of LLVM ns_per_call)"
  read -r _ abytes <<< "$(of A bytes_per_edge)"
  read -r _ bbytes <<< "$(of B bytes_per_edge)"
  printf '%-9s %8s | %9s %9s | %9s %9s | %9s %9s | %7s %7s | %6s %7s\n' "$shape" "$calls" \
    "$amin" "$amed" "$bmin" "$bmed" "$lmin" "$lmed" "$abytes" "$bbytes" \
    "$(ratio "$bmed" "$amed")" "$(ratio "$bmed" "$lmed")"
done
echo "ns per call operation over $reps fresh process(es) each; bytes: median heap bytes per edge;"
echo "ratios of the medians (below 1: B is faster)."
