drop table KWX_NET_Zones;

create table KWX_NET_Zones (
   HWARE_SYS_ID varchar(64) NOT NULL,
   CFG_CHG_TYPE varchar(12) NOT NULL,
   CFG_CHG_TIME varchar(32) NOT NULL,
   Row_Index varchar(5) NOT NULL,
   Name varchar(8),
   State varchar(255),
   Name4 varchar(255),
   Place varchar(255) );

alter table KWX_NET_Zones add primary key ( HWARE_SYS_ID, CFG_CHG_TYPE, Row_Index );

drop view KWX_VNET_Zones;

create view KWX_VNET_Zones
as
select
   COMPUTER_SYS.QVE_OBJECT_ID,
   COMPUTER_SYS.QVE_OBJECT_LABEL,
   KWX_NET_Zones.*
from
   COMPUTER_SYS, KWX_NET_Zones
where
   COMPUTER_SYS.HWARE_SYS_ID =
   KWX_NET_Zones.HWARE_SYS_ID;

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VNET_Zones');
