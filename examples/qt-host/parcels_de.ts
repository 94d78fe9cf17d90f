<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<!-- SPDX-License-Identifier: MIT -->
<TS version="2.1" language="de">
<context>
  <name>GuidedForm</name>
  <message><source>&amp;Help</source><translation>&amp;Hilfe</translation></message>
  <message><source>Show me &amp;around</source><translation>&amp;Rundgang</translation></message>
  <message><source>&amp;Tips</source><translation>&amp;Tipps</translation></message>
</context>
<context>
  <name>OrderForm</name>
  <message><source>E&amp;xpress</source><translation>E&amp;xpress</translation></message>
  <message><source>&amp;Insured</source><translation>&amp;Versichert</translation></message>
  <message><source>C&amp;lear</source><translation>&amp;Leeren</translation></message>
  <message><source>&amp;Cancel this order</source><translation>Bestellung &amp;stornieren</translation></message>
  <message><source>Parcels</source><translation>Pakete</translation></message>
  <message><source>Orders</source><translation>Bestellungen</translation></message>
  <message><source>&amp;Order</source><translation>&amp;Bestellen</translation></message>
  <message><source>To</source><translation>An</translation></message>
  <message><source>&amp;Name</source><translation>&amp;Name</translation></message>
  <message><source>Ci&amp;ty</source><translation>&amp;Ort</translation></message>
  <message><source>N&amp;umber</source><translation>An&amp;zahl</translation></message>
  <message><source>Price</source><translation>Preis</translation></message>
  <message><source>New &amp;order</source><translation>&amp;Neue Bestellung</translation></message>
  <message><source>Your orders</source><translation>Ihre Bestellungen</translation></message>
  <message><source>&amp;Your orders</source><translation>&amp;Ihre Bestellungen</translation></message>
  <message><source>%1 €</source><translation>%1 €</translation></message>
  <message><source>Ordered for %1: %2</source><translation>Bestellt für %1: %2</translation></message>
</context>
<context>
  <name>TipsPanel</name>
  <message><source>Tips</source><translation>Tipps</translation></message>
  <message><source>&amp;Next tip</source><translation>&amp;Nächster Tipp</translation></message>
  <message><source>&amp;Close</source><translation>&amp;Schließen</translation></message>
</context>
<context>
  <name>qz::Guide</name>
  <message><source>Skip</source><translation>Überspringen</translation></message>
  <message><source>Back</source><translation>Zurück</translation></message>
  <message><source>Next</source><translation>Weiter</translation></message>
  <message><source>Points at: %1</source><translation>Zeigt auf: %1</translation></message>
</context>
</TS>
