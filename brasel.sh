#!/usr/bin/env bash
# The two commands of the README:
#   ./brasel.sh demo   builds Brasel, prepares the embedded demo restaurant and opens the program
#   ./brasel.sh test   builds Brasel and runs every test (PostgreSQL ones on a throwaway server)
# Both install the Debian packages they need, as root or through sudo.
set -euo pipefail

here="$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)"
cd "$here"

packages=(cmake ninja-build g++ pkg-config qt6-base-dev libqt6sql6-sqlite libqt6sql6-psql
          qt6-serialport-dev libssl-dev libgtest-dev libgmock-dev libbenchmark-dev
          fonts-liberation socat poppler-utils)
test_packages=(postgresql-15)

say() { printf '\033[1m[brasel]\033[0m %s\n' "$*"; }
die() { printf '\033[1;31m[brasel]\033[0m %s\n' "$*" >&2; exit 1; }

install_missing() {
    local missing=()
    for p in "$@"; do
        dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q "install ok installed" || missing+=("$p")
    done
    [ ${#missing[@]} -eq 0 ] && return 0
    say "A instalar os pacotes em falta: ${missing[*]}"
    local run=()
    if [ "$(id -u)" -ne 0 ]; then
        if command -v sudo >/dev/null 2>&1 && sudo -n true 2>/dev/null; then
            run=(sudo)
        elif command -v sudo >/dev/null 2>&1 && [ -t 0 ]; then
            run=(sudo)
        else
            die "Faltam pacotes (${missing[*]}) e não é possível instalá-los: corra este comando como root ou com sudo, ou peça ao administrador: apt-get install ${missing[*]}"
        fi
    fi
    "${run[@]}" env DEBIAN_FRONTEND=noninteractive apt-get update -qq >/dev/null ||
        die "apt-get update falhou."
    "${run[@]}" env DEBIAN_FRONTEND=noninteractive apt-get install -y -qq --no-install-recommends "${missing[@]}" >/dev/null ||
        die "apt-get install falhou para: ${missing[*]}"
}

build() { # build <dir> [cmake options...] [-- targets...]
    local dir="$1"; shift
    local options=() targets=()
    while [ $# -gt 0 ] && [ "$1" != "--" ]; do options+=("$1"); shift; done
    [ "${1:-}" = "--" ] && { shift; targets=("$@"); }
    cmake -S . -B "$dir" -G Ninja -DCMAKE_BUILD_TYPE=RelWithDebInfo "${options[@]}" >/dev/null
    if [ ${#targets[@]} -gt 0 ]; then
        cmake --build "$dir" --parallel "$(nproc)" --target "${targets[@]}"
    else
        cmake --build "$dir" --parallel "$(nproc)"
    fi
}

# A PostgreSQL cluster of our own in a temporary folder, on a loopback port, owned by postgres.
pg_dir=""
start_postgres() {
    if [ -n "${BRASEL_TEST_PG:-}" ]; then
        say "Testes PostgreSQL no servidor indicado: $BRASEL_TEST_PG"
        return 0
    fi
    if [ "$(id -u)" -ne 0 ]; then
        say "Sem root não se cria um servidor PostgreSQL temporário: os testes pg são saltados (defina BRASEL_TEST_PG para usar um servidor)."
        return 0
    fi
    local bin=/usr/lib/postgresql/15/bin
    pg_dir="$(mktemp -d /tmp/brasel-pg.XXXXXX)"
    chown postgres "$pg_dir"
    local password; password="$(head -c 18 /dev/urandom | base64 | tr -dc 'A-Za-z0-9')"
    printf '%s\n' "$password" > "$pg_dir/pw"; chown postgres "$pg_dir/pw"; chmod 600 "$pg_dir/pw"
    local port
    for port in $(seq 55432 55532); do
        (exec 3<>"/dev/tcp/127.0.0.1/$port") 2>/dev/null || break
    done
    runuser -u postgres -- "$bin/initdb" -D "$pg_dir/data" -A scram-sha-256 -U postgres \
        --pwfile="$pg_dir/pw" -E UTF8 --locale=C.UTF-8 >"$pg_dir/initdb.log" 2>&1 ||
        die "initdb falhou (ver $pg_dir/initdb.log)"
    runuser -u postgres -- "$bin/pg_ctl" -D "$pg_dir/data" -l "$pg_dir/server.log" -w \
        -o "-p $port -k $pg_dir -c listen_addresses=127.0.0.1 -c fsync=off -c max_connections=200" \
        start >/dev/null || die "O servidor PostgreSQL não arrancou (ver $pg_dir/server.log)"
    export BRASEL_TEST_PG="postgresql://127.0.0.1:$port"
    export BRASEL_TEST_PG_USER=postgres
    export BRASEL_TEST_PG_PASSWORD="$password"
    say "Servidor PostgreSQL temporário em 127.0.0.1:$port"
}
stop_postgres() {
    if [ -n "$pg_dir" ] && [ -d "$pg_dir/data" ]; then
        runuser -u postgres -- /usr/lib/postgresql/15/bin/pg_ctl -D "$pg_dir/data" -m immediate stop >/dev/null 2>&1 || true
        rm -rf "$pg_dir"
    fi
}

cmd_test() {
    install_missing "${packages[@]}" "${test_packages[@]}"
    trap stop_postgres EXIT
    start_postgres
    say "A compilar (build/)..."
    build build -DBRASEL_BUILD_UI=ON -DBRASEL_BUILD_BENCH=ON
    say "A correr todos os testes..."
    (cd build && QT_QPA_PLATFORM=offscreen ctest --output-on-failure --parallel "$(nproc)" --timeout 600)
    say "A compilar com AddressSanitizer e UndefinedBehaviorSanitizer (build-asan/)..."
    build build-asan -DCMAKE_BUILD_TYPE=Debug -DBRASEL_SANITIZE=ON -DBRASEL_BUILD_UI=OFF -DBRASEL_BUILD_BENCH=OFF \
        -- brasel_tests_unit brasel_tests_db brasel-admin
    say "Testes unit e db com sanitizers..."
    (cd build-asan && ASAN_OPTIONS=detect_leaks=0 UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1 \
        ctest -L '^(unit|db)$' --output-on-failure --parallel "$(nproc)" --timeout 900)
    say "Todos os testes passaram."
}

cmd_demo() {
    install_missing "${packages[@]}"
    say "A compilar (build/)..."
    build build -DBRASEL_BUILD_UI=ON -DBRASEL_BUILD_BENCH=OFF -DBUILD_TESTING=OFF
    "$here/tools/demo-setup.sh" "$here/build"
}

case "${1:-}" in
    test) cmd_test ;;
    demo) cmd_demo ;;
    *) echo "uso: $0 demo|test"; exit 2 ;;
esac
