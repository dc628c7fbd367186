#!/usr/bin/env bash
# Prepares the embedded demo restaurant in .run/demo/ and starts Brasel on it.
# Usage: tools/demo-setup.sh <build folder>
set -euo pipefail

here="$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)"
build="${1:-$here/build}"
admin="$build/src/brasel-admin"
brasel="$build/src/brasel"
run="$here/.run/demo"
dados="$run/dados"
export BRASEL_SETTINGS_DIR="$run/definicoes"

say() { printf '\033[1m[brasel]\033[0m %s\n' "$*"; }

mkdir -p "$dados" "$BRASEL_SETTINGS_DIR" "$run/actualizacoes"

# The demo's password is made once and kept beside it.
if [ -f "$run/password" ]; then
    password="$(cat "$run/password")"
else
    password="demo-$(head -c 6 /dev/urandom | base64 | tr -dc 'a-z0-9' | head -c 6)"
    printf '%s\n' "$password" > "$run/password"
    chmod 600 "$run/password"
fi

# The demo's own signing key, made once and kept beside it (never a deployment's key).
chave="$run/chave.key"
if [ ! -f "$chave" ]; then
    "$admin" generate-key --file "$chave"
fi

# Config.cfg: data folder, signing-key file, certificate number, serial-port map, update folder.
# The port map is the device simulator's: COM1 the ticket printer, COM2 the customer display.
dispositivos="$run/dispositivos"
mkdir -p "$dispositivos"
printf '%s\r\n%s\r\n%s\r\n%s\r\n%s\r\n' "$dados" "$chave" "9999" \
    "$dispositivos/portas.cfg" "$run/actualizacoes" > "$run/Config.cfg"

if [ ! -f "$dados/Vendrola0001.sqlite" ]; then
    say "A criar a empresa de demonstração 0001..."
    "$admin" demo --server "$dados" --company 0001 --login SUPERVISOR --password "$password" \
        --demo-password "$password"
fi
"$admin" check --server "$dados" --company 0001 --login SUPERVISOR --password "$password"
"$admin" add-server --server "$dados" --login SUPERVISOR --password "$password"

cat > "$run/LEIA-ME.txt" <<TXT
Restaurante de demonstração do Brasel

Empresa 0001 no servidor embutido: $dados
Definições do posto: $BRASEL_SETTINGS_DIR
Config.cfg: $run/Config.cfg
Dispositivos simulados (impressora COM1, mostrador COM2): $dispositivos

Utilizadores (todos com a password "$password"):
  SUPERVISOR  supervisor (código 01)
  ANA, RUI    empregados de mesa
TXT
say "Empresa de demonstração pronta em $dados"
say "Utilizadores: SUPERVISOR (supervisor), ANA e RUI (empregados); password: $password"

if [ -z "${DISPLAY:-}" ] && [ -z "${WAYLAND_DISPLAY:-}" ] && [ -z "${QT_QPA_PLATFORM:-}" ]; then
    say "Não há ecrã gráfico nesta sessão: corra ./brasel.sh demo numa sessão gráfica, ou com um ecrã virtual: xvfb-run -a ./brasel.sh demo"
    exit 0
fi
# The simulated printer and display live as long as the program.
"$build/tools/devsim/devsim" --pasta "$dispositivos" --servidor "$dados" --empresa 0001 \
    --login SUPERVISOR --password "$password" --impressora COM1:EP1 --display COM2 \
    > "$dispositivos/devsim.log" 2>&1 &
devsim_pid=$!
trap 'kill $devsim_pid 2>/dev/null || true' EXIT
for _ in $(seq 50); do [ -s "$dispositivos/portas.cfg" ] && break; sleep 0.1; done
say "Dispositivos simulados: talões em $dispositivos/COM1.txt, mostrador em $dispositivos/COM2.txt"
say "A abrir o Brasel..."
"$brasel" --config "$run/Config.cfg"
