# Completion of edid-composer's command line in bash.

# The connectors of this machine that a display is looked for at, as "card0-HDMI-A-1".
_edid_composer_connectors() {
  local word directory=${EDID_COMPOSER_DRM_DIR:-/sys/class/drm}
  for ((word = 1; word < COMP_CWORD; ++word)); do
    if [[ ${COMP_WORDS[word]} == --drm-dir ]] && ((word + 1 < COMP_CWORD)); then
      directory=${COMP_WORDS[word + 1]}
    fi
  done
  local edid
  for edid in "$directory"/*/edid; do
    if [[ -e $edid ]]; then
      edid=${edid%/edid}
      printf '%s\n' "${edid##*/}"
    fi
  done
}

# The first word that is the name of a command.
_edid_composer_command() {
  local word
  for ((word = 1; word < COMP_CWORD; ++word)); do
    case ${COMP_WORDS[word]} in
      compose | explain | print | diff | sinks | check-platform | audio-mask | platform)
        printf '%s\n' "${COMP_WORDS[word]}"
        return
        ;;
    esac
  done
}

_edid_composer_options() {
  case $1 in
    compose | explain)
      printf '%s\n' --platform --sink --drm-dir --port --current-mode --audio-mask --audio-sink-filter --3d --latency \
        --debug
      ;;&
    compose) printf '%s\n' --output -o --format --jobs --strict --log ;;
    explain) printf '%s\n' --want --wide --json --html ;;
    print) printf '%s\n' --brief --drm-dir ;;
    diff) printf '%s\n' --only-changes --drm-dir ;;
    sinks) printf '%s\n' --drm-dir ;;
    check-platform) printf '%s\n' --sink --drm-dir --strict ;;
    platform) printf '%s\n' --hdmi2 --keys ;;
    '') printf '%s\n' --version ;;
  esac
  printf '%s\n' --help -h
}

# Appends the words that begin with what is being written; of a whole line each.
_edid_composer_offer() {
  local word
  while IFS= read -r word; do
    if [[ $word == "$1"* ]]; then
      COMPREPLY+=("$word")
    fi
  done
}

_edid_composer_offer_files() {
  _edid_composer_offer "$1" < <(compgen -f -- "$1")
  compopt -o filenames 2>/dev/null
}

_edid_composer_offer_folders() {
  _edid_composer_offer "$1" < <(compgen -d -- "$1")
  compopt -o filenames 2>/dev/null
}

# Files, and the connectors that an EDID can be read from as well.
_edid_composer_offer_edids() {
  _edid_composer_offer_files "$1"
  _edid_composer_offer "$1" < <(_edid_composer_connectors)
}

# The value of an option; fails for one that has none.
_edid_composer_offer_value() {
  case $1 in
    --sink) _edid_composer_offer_edids "$2" ;;
    --platform | --output | -o | --html) _edid_composer_offer_files "$2" ;;
    --drm-dir) _edid_composer_offer_folders "$2" ;;
    --3d) _edid_composer_offer "$2" < <(printf '%s\n' off sink on) ;;
    --format) _edid_composer_offer "$2" < <(printf '%s\n' raw hex) ;;
    --port) _edid_composer_offer "$2" < <(printf '%s\n' {0..14} 0..3) ;;
    --current-mode) _edid_composer_offer "$2" < <(printf '%s\n' 1920x1080p60 1920x1080p50 1920x1080p24 1920x1080i60 \
      1920x1080i50 1280x720p60 1280x720p50 720x480p60 720x576p50) ;;
    --jobs | --audio-mask | --latency | --want) ;;
    *) return 1 ;;
  esac
}

_edid_composer() {
  COMPREPLY=()
  local current=${COMP_WORDS[COMP_CWORD]} previous=${COMP_WORDS[COMP_CWORD - 1]} command
  # Bash takes "=" for a word of its own.
  if [[ $current == = ]]; then
    current=
  elif [[ $previous == = ]]; then
    previous=${COMP_WORDS[COMP_CWORD - 2]}
  fi
  if _edid_composer_offer_value "$previous" "$current"; then
    return
  fi
  command=$(_edid_composer_command)
  if [[ $current == -* ]]; then
    _edid_composer_offer "$current" < <(_edid_composer_options "$command")
    return
  fi
  case $command in
    '') _edid_composer_offer "$current" < <(printf '%s\n' compose explain print diff sinks check-platform \
      audio-mask platform) ;;
    print | diff) _edid_composer_offer_edids "$current" ;;
    check-platform) _edid_composer_offer_files "$current" ;;
  esac
}

complete -F _edid_composer edid-composer
