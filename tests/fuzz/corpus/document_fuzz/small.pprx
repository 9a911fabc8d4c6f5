<?xml version="1.0" encoding="UTF-8"?>
<pprDocument version="1">
  <products>
    <product id="P1" name="Underbody" alias="PPRProduct"/>
    <product id="P2" father="P1" name="Panel"/>
    <product id="P3" father="P1" name="Panel copy" reference="P2"/>
    <product id="R1" name="Resources" alias="PPRResources"/>
    <product id="R2" father="R1" name="Robot" resourceClass="Robot" planType="Robot"/>
  </products>
  <assemblies>
    <assembly id="M1" name="Floor"><component ref="P2"/></assembly>
    <assembly id="M2" name="Body"><component ref="M1"/><component ref="P3"/></assembly>
  </assemblies>
  <process>
    <activity id="A1" type="BIWActivityRoot" label="Line">
      <activity id="A2" type="BIWActivityStation" label="S1" cycleTime="45" x="12.5" y="12.5" state="1" width="80" height="30">
        <input id="IO1" item="P2"/>
        <output id="IO2" item="M1"/>
        <item ref="P2" via="IO1"/>
        <resource ref="R2"/>
        <attribute name="Shift" type="long" value="2"/>
        <attribute name="Load" type="double" value="0.75"/>
        <attribute name="Note" type="string" value="caf&#233; &amp; &lt;tools&gt;"/>
      </activity>
      <activity id="A3" type="BIWActivityStation" label="S2" time="-1.5"/>
      <node id="C1" type="Start"/>
      <flow from="A2" to="A3"/>
    </activity>
  </process>
  <planning>
    <planType id="T1"><attribute name="name" value="Line"/></planType>
    <planType id="T2" base="T1"><attribute name="name" value="Station"/><relation name="holds" to="T1"/></planType>
    <hubRecord object="A2"><attribute name="Owner" type="string" value="Plant 3"/></hubRecord>
  </planning>
</pprDocument>
