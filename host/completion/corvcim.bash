# bash completion for corvcim                                              -*- shell-script -*-

# Puts the words that begin like the current one into COMPREPLY.
_corvcim_offer() {
  mapfile -t COMPREPLY < <(compgen -W "$*" -- "$current")
}

_corvcim_classes() {
  _corvcim_offer "$("${COMP_WORDS[0]}" classes 2>/dev/null | awk 'NR > 1 { print $1 }')"
}

# A file after a word such as json:, which bash takes for a word of its own.
_corvcim_files() {
  compopt -o filenames
  mapfile -t COMPREPLY < <(compgen -f -- "$1")
}

_corvcim_inventory() {
  # Bash splits words at colons: "json:FILE" comes as "json", ":", "FILE".
  if [[ $current == : ]]; then
    _corvcim_files ""
  elif [[ ${COMP_WORDS[COMP_CWORD - 1]} == : ]]; then
    _corvcim_files "$current"
  else
    mapfile -t COMPREPLY < <(compgen -W "live root: snapshot: json: smbios: hwloc:" -f -- "$current")
    compopt -o nospace
  fi
}

_corvcim_description() {
  if [[ $current == : ]]; then
    _corvcim_files ""
  elif [[ ${COMP_WORDS[COMP_CWORD - 1]} == : ]]; then
    _corvcim_files "$current"
  else
    _corvcim_offer "hwloc: hwloc-synthetic:"
    compopt -o nospace
  fi
}

# The formats that the verb has, as its help lists them; without a verb all.
_corvcim_formats() {
  local formats
  formats=$("${COMP_WORDS[0]}" "$verb" --help 2>/dev/null | sed -n '/^Output: /{s///;s/\.$//;s/,//g;s/ or / /;p;}')
  _corvcim_offer "${formats:-text table csv mof json svg dot}"
}

_corvcim() {
  local current=${COMP_WORDS[COMP_CWORD]} previous=${COMP_WORDS[COMP_CWORD - 1]} word verb=
  local verbs="classes ei ein gi ai ain ri rin inventory explain snapshot diff tree health help"
  local options="--inventory --output --namespace --library --companion --language --help --version"

  for word in "${COMP_WORDS[@]:1:COMP_CWORD-1}"; do
    [[ " $verbs " == *" $word "* ]] && verb=$word
  done
  [[ $previous == : ]] && previous=${COMP_WORDS[COMP_CWORD - 3]}
  [[ $current == : ]] && previous=${COMP_WORDS[COMP_CWORD - 2]}

  case $previous in
    -i | --inventory) _corvcim_inventory && return ;;
    -o | --output) _corvcim_formats && return ;;
    -l | --library | --companion) _corvcim_files "$current" && return ;;
    -n | --namespace) _corvcim_offer "root/cimv2" && return ;;
    --language) _corvcim_offer "de en es fr ja zh_CN" && return ;;
    --from) _corvcim_description && return ;;
    --ignore) _corvcim_offer "CurrentClockSpeed description cpus status" && return ;;
    -ac | -arc) _corvcim_classes && return ;;
    -ar | -arr)
      _corvcim_offer "Antecedent Dependent GroupComponent PartComponent ManagedElement Capabilities"
      return
      ;;
  esac

  if [[ $current == -* ]]; then
    case $verb in
      ei | ein | gi) options+=" --columns --as-is" ;;
      ai | ain) options+=" --columns --as-is -ac -arc -ar -arr" ;;
      ri | rin) options+=" --columns --as-is -ac -arc -ar" ;;
      diff) options+=" --ignore" ;;
      snapshot) options+=" --unmasked" ;;
      inventory) options+=" --from" ;;
    esac
    _corvcim_offer "$options"
  elif [[ -z $verb || $verb == help ]]; then
    _corvcim_offer "$verbs"
  elif [[ $verb == diff ]]; then
    _corvcim_inventory
  elif [[ $verb == snapshot ]]; then
    _corvcim_files "$current"
  elif [[ $verb == @(classes|ei|ein|gi|ai|ain|ri|rin|explain) ]]; then
    _corvcim_classes
  fi
}

complete -F _corvcim corvcim
