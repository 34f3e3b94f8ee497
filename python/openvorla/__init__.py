"""Python plug-ins for the Vorla application.

`OpenVorla` holds the host's value classes and function sets; `OpenVorlaVPx`
holds the proxy classes that plug-ins derive from and `VFnPlugin`.
"""
