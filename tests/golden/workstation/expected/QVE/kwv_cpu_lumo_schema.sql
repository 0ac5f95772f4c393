drop table KWX_Processor_53s;

create table KWX_Processor_53s (
   HWARE_SYS_ID varchar(64) NOT NULL,
   CFG_CHG_TYPE varchar(12) NOT NULL,
   CFG_CHG_TIME varchar(32) NOT NULL,
   Row_Index varchar(5) NOT NULL,
   Processor_identifi varchar(64),
   Family varchar(255),
   CPUStatus varchar(255),
   Family5 varchar(255),
   MaxClockSpeed varchar(20),
   CacheSize varchar(20),
   LoadPercentage varchar(20),
   Temperature varchar(20),
   Cooled varchar(32),
   Voltage varchar(32),
   Grade varchar(32),
   InstallDate varchar(25),
   Uptime varchar(25),
   PowerManagementCap varchar(255),
   NUM varchar(255),
   Notes varchar(255),
   Host varchar(32),
   SERNUM varchar(12),
   Elsewhere varchar(255),
   Extra varchar(255),
   siz varchar(6),
   DESCRIP varchar(255) );

alter table KWX_Processor_53s add primary key ( HWARE_SYS_ID, CFG_CHG_TYPE, Row_Index );

drop view KWX_VProcessor_53s;

create view KWX_VProcessor_53s
as
select
   COMPUTER_SYS.QVE_OBJECT_ID,
   COMPUTER_SYS.QVE_OBJECT_LABEL,
   KWX_Processor_53s.*
from
   COMPUTER_SYS, KWX_Processor_53s
where
   COMPUTER_SYS.HWARE_SYS_ID =
   KWX_Processor_53s.HWARE_SYS_ID;

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VProcessor_53s');
